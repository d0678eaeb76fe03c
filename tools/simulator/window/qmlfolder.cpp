#include "qmlfolder.h"

#include <QDateTime>
#include <QDirIterator>
#include <QFileInfo>
#include <QTimer>

namespace Simulator {

QmlFolder::QmlFolder(const QString &path, QObject *parent)
    : QObject(parent)
    , m_path(path)
    , m_timer(new QTimer(this))
{
    m_files = snapshot();
    m_timer->setInterval(CheckInterval);
    connect(m_timer, &QTimer::timeout, this, &QmlFolder::check);
    m_timer->start();
}

QHash<QString, QString> QmlFolder::snapshot() const
{
    QHash<QString, QString> files;
    QDirIterator it(m_path, QDir::Files, QDirIterator::Subdirectories);
    while (it.hasNext()) {
        const QFileInfo file(it.next());
        files.insert(file.filePath(),
                     QStringLiteral("%1 %2")
                             .arg(file.size())
                             .arg(file.lastModified().toMSecsSinceEpoch()));
    }
    return files;
}

void QmlFolder::check()
{
    QHash<QString, QString> files = snapshot();
    if (files == m_files)
        return;
    m_files.swap(files);
    emit changed();
}

} // namespace Simulator
