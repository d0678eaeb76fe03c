// The simulator's window, drawn off screen: a page for every view of the module loads without
// warnings, the incoming-call story shows its popup exactly while the trace says it is shown,
// and a popup's button calls the controller slot it names.

#include "testsupport.h"

#include "headunitwindow.h"
#include "outputwriter.h"
#include "scenarioreader.h"
#include "scenariorunner.h"
#include "virtualeventdispatcher.h"

#include <brisken/viewmanager.h>
#include <hmiphoneviews.h>
#include <host/modulehost.h>
#include <journal/journal.h>
#include <mavrosk/bridge.h>

#include <QFile>
#include <QGuiApplication>
#include <QQmlEngine>
#include <QQuickItem>
#include <QtTest>

#include <cstdio>

namespace {

QStringList s_warnings;

void recordWarning(QtMsgType type, const QMessageLogContext &, const QString &message)
{
    if (type != QtDebugMsg && type != QtInfoMsg)
        s_warnings.append(message);
}

QQuickItem *findItem(QQuickItem *item, const QString &name)
{
    if (item->objectName() == name)
        return item;
    for (QQuickItem *child : item->childItems()) {
        if (QQuickItem *found = findItem(child, name))
            return found;
    }
    return nullptr;
}

// The popups the display draws in front (not covered), by view name.
QStringList drawnPopups(QQuickItem *item)
{
    QStringList names;
    if (item->isVisible() && item->objectName().startsWith(QLatin1String("popup:"))
        && item->property("isTop").toBool())
        names.append(item->objectName().mid(6));
    for (QQuickItem *child : item->childItems())
        names += drawnPopups(child);
    return names;
}

QStringList viewNames()
{
#define HMIPHONE_VIEW_NAME_STRING(name) QStringLiteral(#name),
    return {HMIPHONE_VIEW_NAMES(HMIPHONE_VIEW_NAME_STRING) QStringLiteral("PhoneStatusAlerts")};
#undef HMIPHONE_VIEW_NAME_STRING
}

} // namespace

class TestSimWindow : public TestSupport::Suite
{
    Q_OBJECT

private slots:
    void initTestCase();
    void cleanupTestCase();
    void popupFollowsTheTrace();
    void popupButtonCallsItsSlot_data();
    void popupButtonCallsItsSlot();
    void everyViewLoads_data();
    void everyViewLoads();

private:
    Simulator::HeadUnitWindow *newWindow();
    void play(const QString &step);

    Simulator::VirtualEventDispatcher *m_clock = nullptr;
    FILE *m_traceFile = nullptr;
    Simulator::OutputWriter *m_output = nullptr;
    Host::ModuleHost *m_host = nullptr;
    QQmlEngine *m_engine = nullptr;
    Simulator::ScenarioRunner *m_runner = nullptr;
    int m_line = 0;
};

void TestSimWindow::initTestCase()
{
    m_clock = Simulator::VirtualEventDispatcher::instance();
    QVERIFY(m_clock);
    m_traceFile = std::tmpfile();
    m_output = new Simulator::OutputWriter(m_clock, Simulator::OutputWriter::Human, m_traceFile);
    Mavrosk::PhoneSource::instance();
    Mavrosk::BluetoothSource::instance();
    Mavrosk::KeySource::instance();
    m_host = new Host::ModuleHost;
    QVERIFY2(m_host->load(QStringLiteral(HMIPHONE_PLUGIN_FILE)), qPrintable(m_host->errorString()));
    m_engine = new QQmlEngine;
    m_runner = new Simulator::ScenarioRunner(m_host, m_engine, QStringLiteral("HmiPhone"), m_output,
                                             m_clock);
    m_runner->finish();
    QVERIFY(m_runner->started());
}

void TestSimWindow::cleanupTestCase()
{
    delete m_runner;
    delete m_engine;
    delete m_host;
    delete m_output;
    std::fclose(m_traceFile);
}

Simulator::HeadUnitWindow *TestSimWindow::newWindow()
{
    auto *window = new Simulator::HeadUnitWindow(
            m_engine, m_output, m_clock,
            [this](const Simulator::ScenarioStep &step) { m_runner->play(step); },
            Simulator::HeadUnitWindow::OffScreen, this);
    window->grab();
    return window;
}

void TestSimWindow::play(const QString &step)
{
    m_runner->play(Simulator::ScenarioStep::parse(step.toUtf8(), ++m_line));
}

void TestSimWindow::popupFollowsTheTrace()
{
    QFile file(QStringLiteral(HMIPHONE_EXAMPLES_DIR "/incoming-call.jsonl"));
    QVERIFY(file.open(QIODevice::ReadOnly | QIODevice::Text));
    QScopedPointer<Simulator::HeadUnitWindow> window(newWindow());
    const QList<Simulator::ScenarioStep> steps = Simulator::ScenarioReader::read(file.readAll());
    QVERIFY(Simulator::ScenarioReader::errors(steps, m_runner->controller()).isEmpty());
    window->setScenario(steps);

    // The trace says which popups are shown; the display must draw just those after each line.
    QStringList traced;
    connect(m_output, &Simulator::OutputWriter::written, window.data(),
            [&traced](const QString &line) {
                const QStringList words = line.simplified().split(QLatin1Char(' '));
                const QString name = words.value(2).section(QLatin1Char('.'), -1);
                if (words.value(1) == QLatin1String("popup-shown"))
                    traced.append(name);
                else if (words.value(1) == QLatin1String("popup-hidden"))
                    traced.removeAll(name);
            });
    int linesWithPopup = 0;
    QStringList mismatches;
    connect(window->player(), &Simulator::ScenarioPlayer::played, window.data(), [&](int line) {
        window->grab();
        const QStringList drawn = drawnPopups(window->rootItem());
        if (drawn != traced)
            mismatches.append(
                    QStringLiteral("line %1: drawn %2, traced %3")
                            .arg(line)
                            .arg(drawn.join(QLatin1Char(',')), traced.join(QLatin1Char(','))));
        linesWithPopup += drawn.contains(QLatin1String("IncomingCall"));
    });
    window->player()->playAll();
    QVERIFY2(mismatches.isEmpty(), qPrintable(mismatches.join(QLatin1Char('\n'))));
    QVERIFY(linesWithPopup > 0);
    QVERIFY(traced.isEmpty());
    QCOMPARE(m_runner->failures(), 0);
}

void TestSimWindow::popupButtonCallsItsSlot_data()
{
    QTest::addColumn<QString>("popup");
    QTest::addColumn<QString>("slot");
    QTest::addColumn<QString>("event");
    QTest::addRow("accept an incoming call") << "IncomingCall"
                                             << "acceptIncomingCall"
                                             << "HmiPhone_AcceptIncomingCall";
    QTest::addRow("reject an incoming call") << "IncomingCall"
                                             << "rejectIncomingCall"
                                             << "HmiPhone_RejectIncomingCall";
}

void TestSimWindow::popupButtonCallsItsSlot()
{
    QFETCH(QString, popup);
    QFETCH(QString, slot);
    QFETCH(QString, event);
    QScopedPointer<Simulator::HeadUnitWindow> window(newWindow());
    play(QStringLiteral("{\"set\": \"phone.incomingCall\", \"value\": false}"));
    play(QStringLiteral("{\"set\": \"phone.incomingCall\", \"value\": true}"));
    window->grab();
    QQuickItem *card = findItem(window->rootItem(), QStringLiteral("popup:") + popup);
    QVERIFY(card);
    QQuickItem *button = findItem(card, QStringLiteral("action:") + slot);
    QVERIFY(button);

    const qint64 before = Platform::Journal::instance()->lastSequence();
    QVERIFY(QMetaObject::invokeMethod(button, "clicked"));
    m_clock->runUntilIdle();
    QCOMPARE(TestSupport::journalValues(QStringLiteral("event"), QStringLiteral("name"), before),
             QStringList{event});
}

void TestSimWindow::everyViewLoads_data()
{
    QTest::addColumn<QString>("viewId");
    for (const QString &name : viewNames())
        QTest::newRow(qPrintable(name))
                << Brisken::ViewManager::viewIdentifier(QStringLiteral("PHONE"), name);
    QTest::newRow("another module's view") << QStringLiteral("HOST.Home");
}

void TestSimWindow::everyViewLoads()
{
    QFETCH(QString, viewId);
    QScopedPointer<Simulator::HeadUnitWindow> window(newWindow());
    QQuickItem *display = findItem(window->rootItem(), QStringLiteral("display"));
    QVERIFY(display);
    // Drawn as the screen and as a popup over it, whichever the module makes of it.
    s_warnings.clear();
    const QtMessageHandler previous = qInstallMessageHandler(&recordWarning);
    display->setProperty("viewId", viewId);
    display->setProperty(
            "popups",
            QVariantList{QVariantMap{{QStringLiteral("id"), viewId},
                                     {QStringLiteral("name"), viewId.section(QLatin1Char('.'), -1)},
                                     {QStringLiteral("top"), true}}});
    const QImage picture = window->grab();
    qInstallMessageHandler(previous);
    QVERIFY2(s_warnings.isEmpty(), qPrintable(s_warnings.join(QLatin1Char('\n'))));
    QCOMPARE(picture.size(), QSize(1280, 720));
    auto *page = display->property("page").value<QQuickItem *>();
    QVERIFY(page);
    QCOMPARE(page->property("viewId").toString(), viewId);
    QVERIFY(findItem(display, QStringLiteral("popup:") + viewId.section(QLatin1Char('.'), -1)));
}

int main(int argc, char *argv[])
{
    // The module's timers run on the simulator's virtual clock, as in the simulator.
    QCoreApplication::setEventDispatcher(new Simulator::VirtualEventDispatcher);
    QScopedPointer<QCoreApplication> app(Simulator::HeadUnitWindow::createApplication(
            argc, argv, Simulator::HeadUnitWindow::OffScreen));
    TestSimWindow test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_simwindow.moc"
