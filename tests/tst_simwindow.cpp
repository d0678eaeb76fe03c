// The simulator's window, drawn off screen: a file for every view of the module loads without
// warnings, each screen and popup shows the simulated phone's data it binds to, the incoming-call
// story shows its popup exactly while the trace says it is shown, a popup's button calls the
// controller slot it names, the German translation leaves no English text on screen, and an
// edited QML file of a --qml folder is drawn at once.

#include "testsupport.h"

#include "headunitwindow.h"
#include "outputwriter.h"
#include "qmlfolder.h"
#include "scenarioreader.h"
#include "scenariorunner.h"
#include "simulatedphone.h"
#include "virtualeventdispatcher.h"

#include <brisken/viewmanager.h>
#include <hmiphoneviews.h>
#include <host/modulehost.h>
#include <journal/journal.h>
#include <mavrosk/bridge.h>
#include <mavrosk/multidplistmodel.h>

#include <QDirIterator>
#include <QFile>
#include <QGuiApplication>
#include <QProcess>
#include <QQmlEngine>
#include <QQuickItem>
#include <QTemporaryDir>
#include <QXmlStreamReader>
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

// The texts the display shows now.
QStringList visibleTexts(QQuickItem *item)
{
    QStringList texts;
    if (!item->isVisible() || qFuzzyIsNull(item->opacity()))
        return texts;
    if (item->inherits("QQuickText") || item->inherits("QQuickTextInput"))
        texts.append(item->property("text").toString());
    for (QQuickItem *child : item->childItems())
        texts += visibleTexts(child);
    return texts;
}

// The buttons whose label does not fit.
QStringList cutLabels(QQuickItem *item)
{
    QStringList labels;
    if (!item->isVisible())
        return labels;
    if (item->objectName() == QLatin1String("buttonLabel") && item->property("truncated").toBool())
        labels.append(item->property("text").toString());
    for (QQuickItem *child : item->childItems())
        labels += cutLabels(child);
    return labels;
}

// A value of the bridge as a view shows it: "phone.textMessageBody" (a property),
// "phone.callList/0/name" (a row's role of a list model or list property; row "min" is the first
// row of the driver-restricted window, role "who" the name or else the number), or "=text" as
// written.
QString bridgeText(const QString &path)
{
    if (path.startsWith(QLatin1Char('=')))
        return path.mid(1);
    auto *phone = Mavrosk::PhoneSource::instance();
    const QStringList parts = path.split(QLatin1Char('/'));
    const QString name = parts.value(0).section(QLatin1Char('.'), 1);
    if (parts.size() == 1)
        return phone->property(name.toLatin1()).toString();
    const int row = parts.value(1) == QLatin1String("min")
            ? phone->driverRestrictedPhonebookModelMinRow()
            : parts.value(1).toInt();
    const QString role = parts.value(2);
    auto value = [&](const QString &key) {
        if (Mavrosk::MultiDPListModel *model = Mavrosk::listModel(parts.value(0)))
            return model->get(row, key).toString();
        return phone->property(name.toLatin1()).toList().value(row).toMap().value(key).toString();
    };
    if (role == QLatin1String("who")) {
        const QString who = value(QStringLiteral("name"));
        return who.isEmpty() ? value(QStringLiteral("number")) : who;
    }
    return value(role);
}

// The English texts of the window that its German translation changes, as patterns of the whole
// text (a "%1" or "%n" stands for anything).
QList<QRegularExpression> englishTexts()
{
    QFile file(QStringLiteral(HMIPHONE_GERMAN_TS));
    if (!file.open(QIODevice::ReadOnly))
        return {};
    QList<QRegularExpression> patterns;
    QXmlStreamReader ts(&file);
    QString source;
    while (!ts.atEnd()) {
        if (ts.readNext() != QXmlStreamReader::StartElement)
            continue;
        if (ts.name() == QLatin1String("source")) {
            source = ts.readElementText();
        } else if (ts.name() == QLatin1String("translation")) {
            // The plural forms of a number's text, one after the other.
            const QString translation = ts.readElementText(QXmlStreamReader::IncludeChildElements);
            if (translation.isEmpty() || translation == source)
                continue;
            QString pattern = QRegularExpression::escape(source);
            pattern.replace(QRegularExpression(QStringLiteral("%[0-9n]")), QStringLiteral(".*"));
            patterns.append(QRegularExpression(QLatin1Char('^') + pattern + QLatin1Char('$')));
        }
    }
    return patterns;
}

// The texts of the phone's own data (names, numbers, messages, replies): the same in any
// language.
QSet<QString> phoneTexts()
{
    QSet<QString> texts;
    auto add = [&texts](const QVariant &value) {
        if (value.userType() == QMetaType::QString)
            texts.insert(value.toString());
        const QVariantList rows = value.toList();
        for (const QVariant &row : rows) {
            const QVariantMap map = row.toMap();
            for (const QVariant &field : map)
                texts.insert(field.toString());
        }
    };
    auto *phone = Mavrosk::PhoneSource::instance();
    for (int i = 0; i < phone->metaObject()->propertyCount(); ++i)
        add(phone->metaObject()->property(i).read(phone));
    for (const auto &model : Mavrosk::listModels()) {
        for (int row = 0; row < model.second->count(); ++row) {
            const QList<QByteArray> roles = model.second->roleNames().values();
            for (const QByteArray &role : roles)
                add(model.second->get(row, QString::fromUtf8(role)));
        }
    }
    return texts;
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
    void viewShowsThePhonesData_data();
    void viewShowsThePhonesData();
    void germanReplacesEveryText();
    void editedFileIsDrawnAgain();
    void galleryPictureIsDrawnAlike_data();
    void galleryPictureIsDrawnAlike();

private:
    void tearDown() override;
    Simulator::HeadUnitWindow *newWindow(const QString &qmlFolder = QString());
    void play(const QString &step);
    // A connected simulated phone, with its contacts and messages downloaded, on the home screen.
    void connectSimulatedPhone();

    QScopedPointer<Simulator::SimulatedPhone> m_phone;
    // The pictures --screenshots writes of each story, by story.
    QTemporaryDir m_screenshots;

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

void TestSimWindow::tearDown()
{
    m_phone.reset();
}

Simulator::HeadUnitWindow *TestSimWindow::newWindow(const QString &qmlFolder)
{
    auto *window = new Simulator::HeadUnitWindow(
            m_engine, m_output, m_clock,
            [this](const Simulator::ScenarioStep &step) { m_runner->play(step); },
            Simulator::HeadUnitWindow::OffScreen, qmlFolder, this);
    window->grab();
    return window;
}

void TestSimWindow::connectSimulatedPhone()
{
    // What the last test left: no phone, no popup, the home screen.
    Mavrosk::resetAll();
    m_clock->runUntilIdle();
    m_clock->advance(60000);
    play(QStringLiteral("{\"open\": \"home\"}"));
    m_phone.reset(new Simulator::SimulatedPhone(m_clock));
    m_phone->connectPhone();
    m_clock->runUntilIdle();
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
    // Each file binds to a phone with data: its lists, a call connected and a second one waiting.
    connectSimulatedPhone();
    play(QStringLiteral("{\"set\": \"phone.incomingCall\", \"value\": true}"));
    play(QStringLiteral("{\"call\": \"acceptIncomingCall\", \"args\": []}"));
    play(QStringLiteral("{\"set\": \"phone.incomingCall\", \"value\": true}"));
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

void TestSimWindow::viewShowsThePhonesData_data()
{
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<QString>("shown"); // the view, or the popup on top
    QTest::addColumn<QStringList>("values"); // what the display must show of the phone's data

    const QString ring = QStringLiteral(R"({"set": "phone.incomingCall", "value": true})");
    const QString accept = QStringLiteral(R"({"call": "acceptIncomingCall", "args": []})");
    const QString messages = QStringLiteral(R"({"call": "viewTextMessages", "args": []})");
    const QString downloaded = QStringLiteral(R"({"advance": 3000})");
    const QString openMessage
            = QStringLiteral(R"({"call": "viewTextMessageOptions", "args": [1]})");
    const QString reply = QStringLiteral(R"({"call": "replyTextMessage", "args": []})");
    const QString choose
            = QStringLiteral(R"({"set": "phone.replyTextSelected", "value": "On my way."})");
    const QString send = QStringLiteral(R"({"call": "sendTextMessage", "args": []})");
    const QString alerts = QStringLiteral(R"({"call": "viewStatusBarAlerts", "args": []})");

    QTest::addRow("incoming call")
            << QStringList{ring} << "IncomingCall"_q
            << QStringList{"phone.callList/0/name"_q, "phone.callList/0/number"_q};
    QTest::addRow("a call a minute in")
            << QStringList{ring, accept, R"({"advance": 65000})"_q} << "CallInProgress"_q
            << QStringList{"phone.callList/0/name"_q, "=1:05"_q};
    QTest::addRow("a second call waiting")
            << QStringList{ring, accept, ring} << "WaitingCall"_q
            << QStringList{"phone.callList/1/name"_q, "phone.callList/0/name"_q};
    QTest::addRow("contacts") << QStringList{R"({"call": "viewContacts", "args": []})"_q}
                              << "PhoneBookList"_q
                              << QStringList{"phone.phoneBook/0/name"_q,
                                             "phone.phoneBook/1/number"_q};
    QTest::addRow("a letter's contacts")
            << QStringList{R"({"call": "viewContacts", "args": []})"_q,
                           R"({"call": "driverRestrictedPhonebookFilterByAlpha", "args": ["M"]})"_q}
            << "PhoneBookList"_q << QStringList{"phone.phoneBook/min/name"_q};
    QTest::addRow("recent calls") << QStringList{R"({"open": "phone"})"_q,
                                                 R"({"call": "viewRecentCalls", "args": []})"_q,
                                                 downloaded}
                                  << "RecentCalls"_q
                                  << QStringList{"phone.recentCallList/0/who"_q,
                                                 "phone.recentCallList/1/time"_q};
    QTest::addRow("messages") << QStringList{messages, downloaded} << "PhoneSmsList"_q
                              << QStringList{"phone.textMessageList/0/who"_q,
                                             "phone.textMessageList/0/text"_q};
    QTest::addRow("a message") << QStringList{messages, downloaded, openMessage} << "PhoneSmsView"_q
                               << QStringList{"phone.textMessageSenderName"_q,
                                              "phone.textMessageBody"_q};
    QTest::addRow("canned replies")
            << QStringList{messages, downloaded, openMessage, reply} << "PhoneSmsReplyView"_q
            << QStringList{"phone.smsReplyMessages/0/text"_q, "phone.smsReplyMessages/2/text"_q};
    QTest::addRow("a message arrives")
            << QStringList{R"({"set": "phone.textMessageBody", "value": "See you at eight?"})"_q,
                           R"({"emit": "phone.newTextMessageAlert", "args": []})"_q}
            << "NewTextMessageAlert2"_q
            << QStringList{"phone.textMessageSenderName"_q, "=See you at eight?"_q};
    QTest::addRow("sending a reply")
            << QStringList{messages, downloaded, openMessage, reply, choose, send}
            << "PhoneSmsSendTextMessage"_q
            << QStringList{"phone.textMessageSenderName"_q, "phone.replyTextSelected"_q};
    QTest::addRow("a reply sent")
            << QStringList{messages,
                           downloaded,
                           openMessage,
                           reply,
                           choose,
                           send,
                           R"({"answer": "PHONE.PhoneSmsSendTextMessage", "call": "initiateSendTextMessage", "args": []})"_q,
                           R"({"advance": 1000})"_q}
            << "PhoneSmsSendTextMessageSuccess"_q << QStringList{"phone.textMessageSenderName"_q};
    QTest::addRow("status alerts") << QStringList{alerts} << "PhoneStatusAlerts"_q
                                   << QStringList{"phone.statusAlertList/0/supportPhoneNumber"_q};
    QTest::addRow("an alert's fix")
            << QStringList{alerts, R"({"call": "fixStatusAlert", "args": [1003]})"_q}
            << "PhoneStatusAlertPopup62"_q
            << QStringList{"phone.statusAlertList/0/supportPhoneNumber"_q};
    QTest::addRow("the number entered")
            << QStringList{R"({"open": "phone"})"_q, R"({"call": "showDialPad", "args": []})"_q,
                           R"({"call": "dialPadButtonPressed", "args": ["0"]})"_q,
                           R"({"call": "dialPadButtonPressed", "args": ["7"]})"_q}
            << "DialKeypad"_q << QStringList{"phone.callNumberEntered"_q};
    QTest::addRow("unread messages on the menu")
            << QStringList{R"({"open": "phone"})"_q} << "PhoneMenu"_q
            << QStringList{"phone.totalUnreadSmsCount"_q};
    QTest::addRow("contacts in the settings")
            << QStringList{R"({"open": "settings/Phone"})"_q,
                           R"({"call": "requestPhoneManageContactsSettingsPage", "args": []})"_q}
            << "PhoneManageContactsSettings"_q << QStringList{"=48 contacts"_q};
    QTest::addRow("battery low")
            << QStringList{R"({"set": "phone.lowBatteryNotification", "value": true})"_q,
                           R"({"set": "phone.deviceBatteryLevel", "value": 1})"_q}
            << "BatteryLow"_q << QStringList{"=Battery level 1 of 5: charge the phone soon."_q};
}

void TestSimWindow::viewShowsThePhonesData()
{
    QFETCH(QStringList, steps);
    QFETCH(QString, shown);
    QFETCH(QStringList, values);
    connectSimulatedPhone();
    QScopedPointer<Simulator::HeadUnitWindow> window(newWindow());
    const int failures = m_runner->failures() + m_runner->stepErrors();
    s_warnings.clear();
    const QtMessageHandler previous = qInstallMessageHandler(&recordWarning);
    for (const QString &step : qAsConst(steps))
        play(step);
    window->grab();
    qInstallMessageHandler(previous);
    QVERIFY2(s_warnings.isEmpty(), qPrintable(s_warnings.join(QLatin1Char('\n'))));
    QCOMPARE(m_runner->failures() + m_runner->stepErrors(), failures);

    QQuickItem *display = findItem(window->rootItem(), QStringLiteral("display"));
    QVERIFY(display);
    const QStringList drawn = drawnPopups(display);
    QVERIFY2(drawn.isEmpty() ? display->property("viewId").toString().endsWith(shown)
                             : drawn.contains(shown),
             qPrintable(QStringLiteral("view %1, popups %2")
                                .arg(display->property("viewId").toString(),
                                     drawn.join(QLatin1Char(',')))));
    const QStringList texts = visibleTexts(display);
    for (const QString &value : qAsConst(values)) {
        const QString text = bridgeText(value);
        QVERIFY2(!text.isEmpty(), qPrintable(value + QStringLiteral(" is empty")));
        QVERIFY2(std::any_of(texts.begin(), texts.end(),
                             [&](const QString &shownText) { return shownText.contains(text); }),
                 qPrintable(QStringLiteral("%1 (\"%2\") not among %3")
                                    .arg(value, text, texts.join(QStringLiteral(" | ")))));
    }
}

void TestSimWindow::germanReplacesEveryText()
{
    const QList<QRegularExpression> english = englishTexts();
    QVERIFY(english.size() > 100);
    QFile file(QStringLiteral(HMIPHONE_EXAMPLES_DIR "/text-message-reply.jsonl"));
    QVERIFY(file.open(QIODevice::ReadOnly | QIODevice::Text));
    const QList<Simulator::ScenarioStep> steps = Simulator::ScenarioReader::read(file.readAll());

    // The story played in English, then in German: each picture's texts, in the window's own
    // words and the translation's, and the buttons whose label does not fit.
    QStringList cut;
    auto englishOnScreen = [&] {
        Mavrosk::resetAll();
        m_clock->advance(60000);
        play(QStringLiteral("{\"open\": \"home\"}"));
        QScopedPointer<Simulator::HeadUnitWindow> window(newWindow());
        QQuickItem *display = findItem(window->rootItem(), QStringLiteral("display"));
        window->setScenario(steps);
        QStringList found;
        connect(window->player(), &Simulator::ScenarioPlayer::played, window.data(), [&](int line) {
            window->grab();
            const QSet<QString> data = phoneTexts();
            for (const QString &text : visibleTexts(display)) {
                if (data.contains(text))
                    continue;
                for (const QRegularExpression &pattern : english) {
                    if (pattern.match(text).hasMatch())
                        found.append(QStringLiteral("line %1: %2").arg(line).arg(text));
                }
            }
            for (const QString &label : cutLabels(display))
                cut.append(QStringLiteral("line %1: %2").arg(line).arg(label));
        });
        window->player()->playAll();
        return found;
    };
    const QStringList inEnglish = englishOnScreen();
    QVERIFY2(inEnglish.size() > 10, qPrintable(inEnglish.join(QLatin1Char('\n'))));
    QString error;
    QVERIFY2(Simulator::HeadUnitWindow::installTranslation(QStringLiteral("de"), &error),
             qPrintable(error));
    const QStringList inGerman = englishOnScreen();
    QVERIFY(Simulator::HeadUnitWindow::installTranslation(QStringLiteral("en"), &error));
    QVERIFY2(inGerman.isEmpty(), qPrintable(inGerman.join(QLatin1Char('\n'))));
    QVERIFY2(cut.isEmpty(), qPrintable(cut.join(QLatin1Char('\n'))));
}

void TestSimWindow::editedFileIsDrawnAgain()
{
    // A designer's copy of the window's QML.
    QTemporaryDir folder;
    QVERIFY(folder.isValid());
    const QDir source(QStringLiteral(HMIPHONE_WINDOW_QML_DIR));
    QDirIterator files(source.path(), QDir::Files, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        const QString file = files.next();
        const QString copy = QDir(folder.path()).filePath(source.relativeFilePath(file));
        QVERIFY(QDir().mkpath(QFileInfo(copy).path()));
        QVERIFY(QFile::copy(file, copy));
    }
    connectSimulatedPhone();
    play(QStringLiteral("{\"open\": \"phone\"}"));
    QScopedPointer<Simulator::HeadUnitWindow> window(newWindow(folder.path()));
    window->watchQmlFolder();
    QQuickItem *title = findItem(window->rootItem(), QStringLiteral("title"));
    QVERIFY(title);
    QCOMPARE(title->property("text").toString(), QStringLiteral("Phone"));

    QFile menu(QDir(folder.path()).filePath(QStringLiteral("screens/PhoneMenu.qml")));
    QVERIFY(menu.open(QIODevice::ReadOnly));
    const QByteArray text = menu.readAll();
    menu.close();
    QVERIFY(menu.open(QIODevice::WriteOnly | QIODevice::Truncate));
    menu.write(QByteArray(text).replace("title: qsTr(\"Phone\")", "title: \"Telephone\""));
    menu.close();
    QSignalSpy reloaded(window.data(), &Simulator::HeadUnitWindow::reloaded);
    m_clock->advance(Simulator::QmlFolder::CheckInterval);
    QCOMPARE(reloaded.count(), 1);
    window->grab();
    title = findItem(window->rootItem(), QStringLiteral("title"));
    QVERIFY(title);
    QCOMPARE(title->property("text").toString(), QStringLiteral("Telephone"));
    // Nothing changed since: nothing is drawn again.
    m_clock->advance(2 * Simulator::QmlFolder::CheckInterval);
    QCOMPARE(reloaded.count(), 1);
}

void TestSimWindow::galleryPictureIsDrawnAlike_data()
{
    // docs/gallery holds pictures of the example stories, named "<story>-<line>.png" after the
    // step that drew them.
    QTest::addColumn<QString>("picture");
    const QStringList pictures = QDir(QStringLiteral(HMIPHONE_GALLERY_DIR))
                                         .entryList({QStringLiteral("*.png")}, QDir::Files);
    QVERIFY(pictures.size() >= 3);
    for (const QString &picture : pictures)
        QTest::newRow(qPrintable(picture)) << picture;
}

void TestSimWindow::galleryPictureIsDrawnAlike()
{
    QFETCH(QString, picture);
    const QString story = picture.section(QLatin1Char('-'), 0, -2);
    const QString line = picture.section(QLatin1Char('-'), -1);
    const QString shots = QDir(m_screenshots.path()).filePath(story);
    if (!QFileInfo::exists(shots)) {
        // As CI draws them: the simulator plays the story off screen, in English.
        QStringList arguments{QStringLiteral("--lang"), QStringLiteral("en"),
                              QStringLiteral("--screenshots"), shots,
                              QStringLiteral(HMIPHONE_EXAMPLES_DIR "/") + story
                                      + QStringLiteral(".jsonl")};
        if (story.startsWith(QLatin1String("simulated-")))
            arguments.prepend(QStringLiteral("--phone=simulated"));
        QProcess simulator;
        simulator.start(QStringLiteral(HMIPHONE_SIM_FILE), arguments);
        QVERIFY(simulator.waitForFinished(30000));
        QCOMPARE(simulator.exitCode(), 0);
    }
    const QImage drawn(QDir(shots).filePath(line));
    const QImage expected(QDir(QStringLiteral(HMIPHONE_GALLERY_DIR)).filePath(picture));
    QVERIFY2(!drawn.isNull(),
             qPrintable(QStringLiteral("%1 draws no picture at line %2").arg(story, line)));
    QCOMPARE(drawn.size(), expected.size());
    // Alike within what fonts and rounding may move: few pixels differ, none by much.
    const QImage a = drawn.convertToFormat(QImage::Format_RGB32);
    const QImage b = expected.convertToFormat(QImage::Format_RGB32);
    int differing = 0;
    for (int y = 0; y < a.height(); ++y) {
        const auto *rowA = reinterpret_cast<const QRgb *>(a.constScanLine(y));
        const auto *rowB = reinterpret_cast<const QRgb *>(b.constScanLine(y));
        for (int x = 0; x < a.width(); ++x) {
            const int difference = qMax(qAbs(qRed(rowA[x]) - qRed(rowB[x])),
                                        qMax(qAbs(qGreen(rowA[x]) - qGreen(rowB[x])),
                                             qAbs(qBlue(rowA[x]) - qBlue(rowB[x]))));
            differing += difference > 32;
        }
    }
    const int allowed = a.width() * a.height() / 500;
    if (differing > allowed) {
        const QString kept = QDir::current().absoluteFilePath(QStringLiteral("gallery-") + picture);
        drawn.save(kept);
        QFAIL(qPrintable(QStringLiteral("%1 pixels differ (at most %2): the story draws %3; if the "
                                        "change is meant, copy it to docs/gallery/%4")
                                 .arg(differing)
                                 .arg(allowed)
                                 .arg(kept, picture)));
    }
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
