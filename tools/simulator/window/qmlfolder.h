#pragma once

#include <QHash>
#include <QObject>
#include <QString>

class QTimer;

namespace Simulator {

// A folder of QML files that a designer edits: changed() follows every write, new file or
// removal under it, checked twice a second. It polls rather than asks the system to notify it,
// because the simulator's virtual clock has no socket notifiers: so a folder is watched the same
// on screen and on the virtual clock (where tests move the time).
class QmlFolder : public QObject
{
    Q_OBJECT
public:
    explicit QmlFolder(const QString &path, QObject *parent = nullptr);

    QString path() const { return m_path; }

    static constexpr int CheckInterval = 500; // ms

signals:
    void changed();

private:
    // Each file's size and time of its last change, by path.
    QHash<QString, QString> snapshot() const;
    void check();

    QString m_path;
    QTimer *m_timer;
    QHash<QString, QString> m_files;
};

} // namespace Simulator
