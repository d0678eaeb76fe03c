#pragma once

#include <QDBusConnection>
#include <QList>
#include <QObject>
#include <QSet>
#include <QString>
#include <QVariantMap>

#include <functional>

class QDBusMessage;
class QDBusObjectPath;
class QDBusServiceWatcher;
class QDBusVariant;
class QTimer;

namespace Platform {
struct JournalEntry;
}

namespace Simulator {

class SimulatedPhone;

// A real phone behind the data bridge: reads oFono's hands-free telephony over D-Bus (the system
// bus, or the bus at a given address) and plays its calls, network and texts into the bridge's
// values and signals; the module's commands to the phone go to oFono. What oFono does not carry
// (contacts, recent calls, the inbox, status alerts, the phone's settings) stays with the
// simulated phone given, which keeps its lists.
//
// It follows the first modem that is powered and online (or the one asked for), and follows
// modems, calls and texts as they come and go. oFono absent, no modem, a modem that goes in a
// call: the phone is reported not connected, and connected again when the modem comes back.
// Every D-Bus call is asynchronous; one that fails or times out reports the command failed where
// the bridge has a way to say so (dialling, accepting, sending a text), and is logged as a
// warning in the category "orvane.mavrosk.ofono".
//
// The mapping between oFono and the bridge is the tables in ofonophone.cpp; mappingMarkdown()
// writes them for the README.
class OfonoPhone : public QObject
{
    Q_OBJECT
public:
    // oFono on the system bus, or on the bus at `busAddress`. `lists` keeps contacts, recent calls
    // and texts; it is made with RealPhoneCalls.
    OfonoPhone(const QString &busAddress, SimulatedPhone *lists, QObject *parent = nullptr);
    ~OfonoPhone() override;

    // The modem to follow ("/hfp/org/bluez/hci0/dev_..."), instead of the first one usable.
    void setModem(const QString &path) { m_wantedModem = path; }
    // How long a command may take before it counts as failed (default 5 s).
    void setCallTimeout(int milliseconds) { m_callTimeout = milliseconds; }
    // Starts looking for oFono on the bus.
    void start();

    // The modem followed now, or empty when no phone is connected.
    QString modem() const { return m_modem; }

    // The mapping tables as Markdown, as the README has them.
    static QString mappingMarkdown();

signals:
    // The phone connected or not, and what to tell people: "phone connected: <the modem's path
    // and model>" or "no phone connected: <why not>".
    void connectionChanged(bool connected, const QString &what);

private slots:
    // Signals of oFono, from any of its objects: the message says which.
    void onModemAdded(const QDBusObjectPath &path, const QVariantMap &properties);
    void onModemRemoved(const QDBusObjectPath &path);
    void onPropertyChanged(const QString &name, const QDBusVariant &value,
                           const QDBusMessage &message);
    void onCallAdded(const QDBusObjectPath &path, const QVariantMap &properties,
                     const QDBusMessage &message);
    void onCallRemoved(const QDBusObjectPath &path, const QDBusMessage &message);
    void onIncomingMessage(const QString &text, const QVariantMap &info,
                           const QDBusMessage &message);

private:
    struct Modem
    {
        QString path;
        QVariantMap properties;
    };
    struct Call
    {
        QString path;
        QString state;
        QString number;
        QString name;
        bool incoming = false; // rang in, rather than dialled
        bool wasActive = false;
        bool multiparty = false;
        bool rejected = false; // the head unit asked it away while it rang
        qint64 connectedAt = -1;
    };

    void connectToBus();
    void ofonoLeft();
    void forgetModem(const QString &path);
    void requestModems();
    // Chooses the modem to follow from those known, and reads its calls, network and battery.
    void chooseModem();
    void dropModem(const QString &why);
    void setConnected(bool connected, const QString &what);
    void readModem();
    bool usable(const Modem &modem) const;
    bool isFollowed(const QDBusMessage &message) const;
    void addCall(const QString &path, const QVariantMap &properties);
    void updateCall(Call &call, const QString &name, const QVariant &value);
    void callGone(const QString &path);
    // The bridge's call values and call list from the calls of now.
    void publishCalls();
    void setNetworkStatus(const QString &status);
    void setBattery(const QVariant &level);

    void onJournalEntry(const Platform::JournalEntry &entry);
    void command(const QString &command, const QVariantList &args);
    // Calls a method of oFono without waiting: `replied` runs with the reply, `failed` (else a
    // warning) with the error when it fails or times out. Answers that come after the modem
    // followed changed are dropped.
    void call(const QString &path, const QString &interface, const QString &method,
              const QVariantList &args, const std::function<void(const QDBusMessage &)> &replied,
              const std::function<void(const QString &)> &failed = {});
    // The first call in the first of these states that has one.
    Call *callIn(const QStringList &states);

    QString m_busAddress;
    QDBusConnection m_bus;
    SimulatedPhone *m_lists;
    QDBusServiceWatcher *m_watcher = nullptr;
    QTimer *m_retry;
    QTimer *m_callClock;
    QString m_wantedModem;
    int m_callTimeout = 5000;
    QList<Modem> m_modems;
    QString m_modem;
    QList<Call> m_calls; // in the order they came
    QString m_networkStatus;
    // Calls (by path) and interfaces the modem spoke of since it was last read.
    QSet<QString> m_heard;
    // Changes with the modem followed: replies to another's calls are dropped.
    int m_session = 0;
    bool m_connected = false;
    QString m_connection; // what was said of the connection last
    QString m_busProblem; // why the bus could not be reached at the last try
};

} // namespace Simulator
