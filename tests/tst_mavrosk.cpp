// Contract of the data-bridge stand-in: values notify on change and only then, the module's
// commands and setters reach the journal with their arguments in order, the phone's side writes
// without journaling, reset brings back a head unit with no phone, and the list models answer.

#include "testsupport.h"

#include <mavrosk/bridge.h>

#include <QMetaProperty>
#include <QSignalSpy>
#include <QtTest>

#include <functional>

using namespace Mavrosk;

namespace {

QList<DataSource *> allSources()
{
    return {PhoneSource::instance(),      EAPhoneSource::instance(), BluetoothSource::instance(),
            ProjectionSource::instance(), SpeechSource::instance(),  KeySource::instance(),
            NavSource::instance(),        GlobalSource::instance(),  ArdelSource::instance()};
}

// A value different from the current one, of the property's own type.
QVariant otherValue(const QVariant &current)
{
    switch (current.userType()) {
    case QMetaType::Bool:
        return !current.toBool();
    case QMetaType::Int:
        return current.toInt() + 7;
    case QMetaType::QString:
        return QString(current.toString() + QStringLiteral("5"));
    case QMetaType::QVariantList:
        return QVariantList(current.toList()) << QVariantMap{{QStringLiteral("text"), 1}};
    default:
        return {};
    }
}

struct BridgeCall
{
    QString call;
    QVariantList args;
};

QList<BridgeCall> bridgeCallsSince(qint64 since)
{
    QList<BridgeCall> calls;
    for (const Platform::JournalEntry &entry : Platform::Journal::instance()->entriesSince(since)) {
        if (entry.kind == QLatin1String("bridge"))
            calls.append({entry.fields.value(QStringLiteral("call")).toString(),
                          entry.fields.value(QStringLiteral("args")).toList()});
    }
    return calls;
}

using Action = std::function<void()>;

} // namespace

Q_DECLARE_METATYPE(Action)

class TestMavrosk : public QObject
{
    Q_OBJECT

private slots:
    void init() { resetAll(); }

    void propertyNotifiesOnChangeOnly_data();
    void propertyNotifiesOnChangeOnly();
    void signalsTheModuleConnectsByName_data();
    void signalsTheModuleConnectsByName();
    void moduleCallsAreJournaledInOrder_data();
    void moduleCallsAreJournaledInOrder();
    void bridgeSideWritesAreNotJournaled();
    void resetRestoresHeadUnitWithoutPhone();
    void keyEventFromTheBridgeSide();
    void listModels();
};

// Every value of every source, so that a property added later is held to the same contract.
void TestMavrosk::propertyNotifiesOnChangeOnly_data()
{
    QTest::addColumn<DataSource *>("source");
    QTest::addColumn<QString>("property");
    for (DataSource *source : allSources()) {
        const QMetaObject *meta = source->metaObject();
        for (int i = DataSource::staticMetaObject.propertyCount(); i < meta->propertyCount(); ++i) {
            const QString name = QString::fromLatin1(meta->property(i).name());
            QTest::addRow("%s.%s", qPrintable(source->shortName()), qPrintable(name))
                    << source << name;
        }
    }
}

void TestMavrosk::propertyNotifiesOnChangeOnly()
{
    QFETCH(DataSource *, source);
    QFETCH(QString, property);
    const QMetaProperty meta = source->metaObject()->property(
            source->metaObject()->indexOfProperty(qPrintable(property)));
    QVERIFY(meta.hasNotifySignal());
    QCOMPARE(QString::fromLatin1(meta.notifySignal().name()), property + QStringLiteral("Changed"));
    QCOMPARE(meta.notifySignal().parameterCount(), 1);

    QSignalSpy spy(source, meta.notifySignal());
    const QVariant changed = otherValue(meta.read(source));
    QVERIFY2(changed.isValid(), meta.typeName());

    QVERIFY(source->setBridgeValue(property, changed));
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.at(0).at(0), changed);
    QCOMPARE(meta.read(source), changed);

    QVERIFY(meta.write(source, changed)); // the same value again, through the plain setter
    QCOMPARE(spy.count(), 1);
}

// Transitions name these signals as strings; a misspelt or retyped signal only fails at run time.
void TestMavrosk::signalsTheModuleConnectsByName_data()
{
    QTest::addColumn<DataSource *>("source");
    QTest::addColumn<QString>("signature");
    const QStringList phoneSignals = {
            QStringLiteral("statusChanged(int)"),
            QStringLiteral("incomingCallChanged(bool)"),
            QStringLiteral("callNumberEnteredChanged(QString)"),
            QStringLiteral("recentCallListStatusChanged(int)"),
            QStringLiteral("messagesDownloadingStatusChanged(int)"),
            QStringLiteral("sendMessageStatusChanged(int)"),
            QStringLiteral("currentExtendedModeChanged(int)"),
            QStringLiteral("replyMessageLineNoChanged(int)"),
            QStringLiteral("smsTotalCountChanged(int)"),
            QStringLiteral("totalUnreadSmsCountChanged(int)"),
            QStringLiteral("missedCallsPresent()"),
            QStringLiteral("phoneDialingFailed(int)"),
            QStringLiteral("phoneCallAcceptingFailed()"),
            QStringLiteral("phoneIncomingCallRemoteRejection()"),
            QStringLiteral("phoneDriverDoorOpenLinkLossReconnectFailedReceived()"),
            QStringLiteral("phoneSiriSCOchannelNotActiveReceived()"),
            QStringLiteral("phonebookSearchReady()"),
            QStringLiteral("newTextMessageAlert()"),
            QStringLiteral("smsPhoneDeclinedAccess()"),
    };
    for (const QString &signature : phoneSignals)
        QTest::addRow("phone %s", qPrintable(signature))
                << static_cast<DataSource *>(PhoneSource::instance()) << signature;
    QTest::addRow("bluetooth deviceConnectedChanged")
            << static_cast<DataSource *>(BluetoothSource::instance())
            << QStringLiteral("deviceConnectedChanged(bool)");
    QTest::addRow("bluetooth phoneDeviceChanged")
            << static_cast<DataSource *>(BluetoothSource::instance())
            << QStringLiteral("phoneDeviceChanged(int)");
    QTest::addRow("projection projectionNotActive")
            << static_cast<DataSource *>(ProjectionSource::instance())
            << QStringLiteral("projectionNotActive(bool)");
    QTest::addRow("projection projectionDIONotActive")
            << static_cast<DataSource *>(ProjectionSource::instance())
            << QStringLiteral("projectionDIONotActive(bool)");
    QTest::addRow("speech displayPairingPopup")
            << static_cast<DataSource *>(SpeechSource::instance())
            << QStringLiteral("displayPairingPopup()");
    QTest::addRow("key keyEvent") << static_cast<DataSource *>(KeySource::instance())
                                  << QStringLiteral("keyEvent(int, int)");
}

void TestMavrosk::signalsTheModuleConnectsByName()
{
    QFETCH(DataSource *, source);
    QFETCH(QString, signature);
    const QByteArray normalized = QMetaObject::normalizedSignature(qPrintable(signature));
    QVERIFY2(source->metaObject()->indexOfSignal(normalized.constData()) >= 0,
             normalized.constData());
}

void TestMavrosk::moduleCallsAreJournaledInOrder_data()
{
    QTest::addColumn<Action>("action");
    QTest::addColumn<QStringList>("calls");
    QTest::addColumn<QVariantList>("args"); // one list of arguments per call

    PhoneSource *phone = PhoneSource::instance();
    const QString number = QStringLiteral("0711123456");
    QTest::addRow("dial, accept, end")
            << Action([=] {
                   phone->dialNumber(number);
                   phone->acceptIncomingCall();
                   phone->endCall();
               })
            << QStringList{QStringLiteral("phone.dialNumber"),
                           QStringLiteral("phone.acceptIncomingCall"),
                           QStringLiteral("phone.endCall")}
            << QVariantList{QVariantList{number}, QVariantList(), QVariantList()};
    QTest::addRow("recent calls with and without a type")
            << Action([=] {
                   phone->downloadRecentCallsList(3);
                   phone->downloadRecentCallsList();
                   phone->dialRecentCall(2, 5);
               })
            << QStringList{QStringLiteral("phone.downloadRecentCallsList"),
                           QStringLiteral("phone.downloadRecentCallsList"),
                           QStringLiteral("phone.dialRecentCall")}
            << QVariantList{QVariantList{3}, QVariantList(), QVariantList{2, 5}};
    QTest::addRow("sms download with and without a device")
            << Action([=] {
                   phone->retrySmsDownload(4);
                   phone->retrySmsDownload();
                   phone->textMessagePlayback(QStringLiteral("Hello"));
               })
            << QStringList{QStringLiteral("phone.retrySmsDownload"),
                           QStringLiteral("phone.retrySmsDownload"),
                           QStringLiteral("phone.textMessagePlayback")}
            << QVariantList{QVariantList{4}, QVariantList(), QVariantList{QStringLiteral("Hello")}};
    QTest::addRow("fix alert, siri") << Action([=] {
        phone->callForFixAlert(12, number);
        phone->toggleSiriActivation(true);
    })
                                     << QStringList{QStringLiteral("phone.callForFixAlert"),
                                                    QStringLiteral("phone.toggleSiriActivation")}
                                     << QVariantList{QVariantList{12, number}, QVariantList{true}};
    QTest::addRow("restricted phonebook window, unchanged values journaled too")
            << Action([=] {
                   phone->setDriverRestrictedPhonebookModelMinRow(-1);
                   phone->setDriverRestrictedPhonebookModelMaxRow(24);
               })
            << QStringList{QStringLiteral("phone.setDriverRestrictedPhonebookModelMinRow"),
                           QStringLiteral("phone.setDriverRestrictedPhonebookModelMaxRow")}
            << QVariantList{QVariantList{-1}, QVariantList{24}};
    QTest::addRow("module setters")
            << Action([=] {
                   phone->setCallNumberEntered(number);
                   phone->setDTMFNumberEntered(QStringLiteral("1#"));
                   phone->setHearItPressed(true);
                   phone->setCurrentRecentCallListType(0);
               })
            << QStringList{QStringLiteral("phone.setCallNumberEntered"),
                           QStringLiteral("phone.setDTMFNumberEntered"),
                           QStringLiteral("phone.setHearItPressed"),
                           QStringLiteral("phone.setCurrentRecentCallListType")}
            << QVariantList{QVariantList{number}, QVariantList{QStringLiteral("1#")},
                            QVariantList{true}, QVariantList{0}};
    QTest::addRow("other sources")
            << Action([] {
                   SpeechSource::instance()->cancelVRSession();
                   GlobalSource::instance()->sendDisplayOnlyModeBeginShutdownRequest();
               })
            << QStringList{QStringLiteral("speech.cancelVRSession"),
                           QStringLiteral("global.sendDisplayOnlyModeBeginShutdownRequest")}
            << QVariantList{QVariantList(), QVariantList()};
}

void TestMavrosk::moduleCallsAreJournaledInOrder()
{
    QFETCH(Action, action);
    QFETCH(QStringList, calls);
    QFETCH(QVariantList, args);

    const qint64 since = Platform::Journal::instance()->lastSequence();
    action();
    const QList<BridgeCall> journaled = bridgeCallsSince(since);
    QCOMPARE(journaled.size(), calls.size());
    for (int i = 0; i < calls.size(); ++i) {
        QCOMPARE(journaled.at(i).call, calls.at(i));
        QCOMPARE(journaled.at(i).args, args.at(i).toList());
    }
}

void TestMavrosk::bridgeSideWritesAreNotJournaled()
{
    PhoneSource *phone = PhoneSource::instance();
    QSignalSpy spy(phone, &PhoneSource::callNumberEnteredChanged);
    const qint64 since = Platform::Journal::instance()->lastSequence();

    QVERIFY(phone->setBridgeValue(QStringLiteral("callNumberEntered"), QStringLiteral("112")));
    phone->setStatus(7);
    QVERIFY(!phone->setBridgeValue(QStringLiteral("noSuchValue"), 1));
    QVERIFY(!phone->setBridgeValue(QStringLiteral("status"), QStringLiteral("seven")));

    QCOMPARE(bridgeCallsSince(since).size(), 0);
    QCOMPARE(spy.count(), 1);
    QCOMPARE(phone->callNumberEntered(), QStringLiteral("112"));
    QCOMPARE(phone->status(), 7);
}

void TestMavrosk::resetRestoresHeadUnitWithoutPhone()
{
    PhoneSource *phone = PhoneSource::instance();
    BluetoothSource *bluetooth = BluetoothSource::instance();
    phone->setBridgeValue(QStringLiteral("deviceBatteryLevel"), 3);
    phone->setBridgeValue(QStringLiteral("incomingCall"), true);
    phone->setBridgeValue(QStringLiteral("callNumberEntered"), QStringLiteral("12"));
    bluetooth->setDeviceConnected(true);
    phone->AlphabetIndexModel()->setRows(
            {QVariantMap{{QStringLiteral("alphabet"), QStringLiteral("A")}}});
    phone->phoneBook()->setListLength(30);

    QSignalSpy battery(phone, &PhoneSource::deviceBatteryLevelChanged);
    QSignalSpy connected(bluetooth, &BluetoothSource::deviceConnectedChanged);
    QSignalSpy status(phone, &PhoneSource::statusChanged);
    const qint64 since = Platform::Journal::instance()->lastSequence();
    resetAll();

    QCOMPARE(phone->deviceBatteryLevel(), -1);
    QCOMPARE(battery.count(), 1);
    QCOMPARE(connected.count(), 1);
    QCOMPARE(status.count(), 0); // unchanged values stay quiet
    QVERIFY(!bluetooth->deviceConnected());
    QVERIFY(!phone->incomingCall());
    QVERIFY(phone->callNumberEntered().isEmpty());
    QCOMPARE(phone->status(), 0);
    QCOMPARE(phone->AlphabetIndexModel()->count(), 0);
    QCOMPARE(phone->phoneBook()->listLength(), 0);
    QCOMPARE(bridgeCallsSince(since).size(), 0);
}

void TestMavrosk::keyEventFromTheBridgeSide()
{
    QSignalSpy spy(KeySource::instance(), &KeySource::keyEvent);
    KeySource::instance()->sendKeyEvent(12, 2);
    QCOMPARE(spy.count(), 1);
    QCOMPARE(spy.at(0), (QVariantList{12, 2}));
}

void TestMavrosk::listModels()
{
    MultiDPListModel *alphabet = PhoneSource::instance()->AlphabetIndexModel();
    InfiniteListModel *contacts = PhoneSource::instance()->phoneBook();
    QSignalSpy countSpy(alphabet, &MultiDPListModel::countChanged);
    alphabet->setRows({QVariantMap{{QStringLiteral("alphabet"), QStringLiteral("A")},
                                   {QStringLiteral("letterIndex"), 0}},
                       QVariantMap{{QStringLiteral("alphabet"), QStringLiteral("B")},
                                   {QStringLiteral("letterIndex"), -1}}});
    contacts->setListLength(60);

    QCOMPARE(alphabet->count(), 2);
    QCOMPARE(countSpy.count(), 1);
    QCOMPARE(alphabet->get(0, QStringLiteral("alphabet")).toString(), QStringLiteral("A"));
    QCOMPARE(alphabet->get(1, QStringLiteral("letterIndex")).toInt(), -1);
    QVERIFY(!alphabet->get(2, QStringLiteral("alphabet")).isValid());
    QVERIFY(!alphabet->get(0, QStringLiteral("noSuchRole")).isValid());
    QCOMPARE(alphabet->rowCount(), 2);
    QCOMPARE(contacts->listLength(), 60);
    QCOMPARE(contacts->rowCount(), 60);
}

QTEST_GUILESS_MAIN(TestMavrosk)
#include "tst_mavrosk.moc"
