#pragma once

#include <QByteArray>
#include <QObject>
#include <QString>

// Marks `text` as the translatable name of an HmiAction; the action translates it in its
// translation context when it is shown.
#define hmiActionNameTr(text) QStringLiteral(text)

namespace Brisken {

// An entry of a menu that one module offers inside another (for example a settings-menu entry):
// a name, an icon, a type, an enabled state and a `triggered()` signal.
class HmiAction : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString name READ name CONSTANT)
    Q_PROPERTY(QString text READ text NOTIFY textChanged)
    Q_PROPERTY(QString iconPath READ iconPath CONSTANT)
    Q_PROPERTY(int actionType READ actionType CONSTANT)
    Q_PROPERTY(bool enabled READ isEnabled WRITE setEnabled NOTIFY enabledChanged)
public:
    HmiAction(const QString &name, const QString &iconPath, int actionType,
              QObject *parent = nullptr);
    ~HmiAction() override;

    QString name() const { return m_name; }
    // The name translated in the translation context.
    QString text() const;
    QString iconPath() const { return m_iconPath; }
    int actionType() const { return m_actionType; }
    QString translationContext() const { return m_translationContext; }
    void setTranslationContext(const QString &context);

    bool isEnabled() const { return m_enabled; }

    // Keeps the enabled state equal to the bool argument of `signal` of `sender` each time it is
    // emitted. `signal` is a signature as made by SIGNAL(); returns false (and logs) when the
    // sender has no such signal.
    bool enabledBinding(const QObject *sender, const char *signal);
    template<typename Sender>
    void enabledBinding(const Sender *sender, void (Sender::*signal)(bool))
    {
        connect(sender, signal, this, &HmiAction::setEnabled);
    }

public slots:
    void setEnabled(bool enabled);
    // Emits triggered() while the action is enabled.
    void trigger();

signals:
    void triggered();
    void enabledChanged(bool enabled);
    void textChanged();

private:
    QString m_name;
    QString m_iconPath;
    int m_actionType;
    QString m_translationContext;
    bool m_enabled = true;
};

} // namespace Brisken
