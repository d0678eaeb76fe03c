#pragma once

// The phone module brought up by the host library as a head unit's host does, for the tests of
// the phone's global popups and reactions, and what the HMI shows as the tests read it.

#include "hmiphonecontroller.h"
#include "hmiphoneintegration.h"
#include "metainvoke.h"
#include "testsupport.h"

#include <brisken/datastore.h>
#include <brisken/viewcontroller.h>
#include <host/modulehost.h>
#include <mavrosk/bluetoothsource.h>
#include <mavrosk/bridge.h>
#include <mavrosk/phonesource.h>
#include <quorvel/hmievent.h>
#include <quorvel/statemachine.h>

#include <memory>

class GlobalHmi
{
public:
    // A clean platform, with a phone connected.
    GlobalHmi()
    {
        Quorvel::StateMachine::destroyInstance();
        Mavrosk::resetAll();
        Brisken::DataStore::reset();
        Platform::Journal::instance()->clear();
        Mavrosk::BluetoothSource::instance()->setDeviceConnected(true);
    }

    // The module linked into the test, or the built plug-in file when one is given.
    bool setUp(const QString &pluginFile = QString())
    {
        if (pluginFile.isEmpty()) {
            m_module = std::make_unique<HmiPhoneModule>();
            m_host.use(m_module.get());
        } else if (!m_host.load(pluginFile)) {
            return false;
        }
        return m_host.setUp(QStringLiteral("HmiPhone"));
    }
    void start() { m_host.start(); }
    bool run(const QString &pluginFile = QString())
    {
        if (!setUp(pluginFile))
            return false;
        start();
        return true;
    }
    Host::ModuleHost &host() { return m_host; }

    static Mavrosk::PhoneSource *phone() { return Mavrosk::PhoneSource::instance(); }
    static qint64 mark() { return Platform::Journal::instance()->lastSequence(); }
    static qint64 post(const QString &event) { return TestSupport::post(event); }

    // What a driver or the phone noticed since `since`, in order, as "kind name": popups asked
    // for and dismissed, views asked for and shown (by view name), transients, events posted,
    // commands to the phone (without arguments) and keys handed back to the platform's seek
    // function.
    static QStringList outputsSince(qint64 since)
    {
        return TestSupport::briefJournalLines(
                since,
                {QStringLiteral("popup-request"), QStringLiteral("popup-dismiss"),
                 QStringLiteral("view-request"), QStringLiteral("view"),
                 QStringLiteral("transient"), QStringLiteral("transient-hide"),
                 QStringLiteral("event"), QStringLiteral("bridge"), QStringLiteral("hardkey")});
    }

    // One step of the phone's side or the driver: "source.property=value" a bridge value (a JSON
    // list when it starts with '['), "source!signal" or "source!signal(argument)" a signal of a
    // data source or of the controller ("controller!..."), anything else an event posted. The
    // machine settles after it.
    void apply(const QString &step)
    {
        const QString source = step.section(QRegularExpression(QStringLiteral("[.!]")), 0, 0);
        const QString member = step.section(QRegularExpression(QStringLiteral("[.!=(]")), 1, 1);
        QObject *object = source == QLatin1String("controller")
                ? m_host.integration()->findChild<HmiPhone::HmiPhoneController *>()
                : nullptr;
        for (Mavrosk::DataSource *candidate : Mavrosk::DataSource::sources())
            object = candidate->shortName() == source ? candidate : object;
        QString error;
        if (step.contains(QLatin1Char('!'))) {
            const QString argument = step.section(QRegularExpression(QStringLiteral("[()]")), 1, 1);
            QVERIFY2(Simulator::invokeByName(object, member,
                                             argument.isEmpty() ? QVariantList()
                                                                : QVariantList{argument},
                                             QMetaMethod::Signal, &error),
                     qPrintable(step + QLatin1Char(' ') + error));
        } else if (step.contains(QLatin1Char('='))) {
            QVERIFY2(TestSupport::setBridgeValue(step), qPrintable(step));
        } else {
            Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(step));
        }
        TestSupport::processUntilIdle();
    }

    // Open, on top or covered: a popup left open under another is not closed.
    static bool isOpen(const QString &view)
    {
        const QStringList popups = Brisken::ViewController::instance()->openPopups();
        return popups.contains(QStringLiteral("PHONE.") + view);
    }

    static bool isActive(const QString &stateName)
    {
        return TestSupport::activeStates().contains(stateName);
    }

private:
    std::unique_ptr<HmiPhoneModule> m_module;
    Host::ModuleHost m_host; // destroyed first: the machine, then the integration
};

// The fixture of the suites on the whole module: a clean GlobalHmi for each test.
class GlobalSuite : public TestSupport::Suite
{
protected:
    void setUp() override { m_hmi = std::make_unique<GlobalHmi>(); }
    void tearDown() override { m_hmi.reset(); }

    std::unique_ptr<GlobalHmi> m_hmi;
};
