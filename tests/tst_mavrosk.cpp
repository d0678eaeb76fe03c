// Contract of the data-bridge stand-in: values notify on change and only then, the module's
// commands and setters reach the journal with their arguments in order, the phone's side writes
// without journaling, reset brings back a head unit with no phone, and the list models answer.

#include "testsupport.h"

#include <mavrosk/bridge.h>

#include <QMetaProperty>
#include <QSignalSpy>
#include <QtTest>

using namespace Mavrosk;

class TestMavrosk : public TestSupport::Suite
{
    Q_OBJECT

protected:
    void setUp() override { resetAll(); }
private slots:

    // Every value of every source, so that a property added later is held to the same contract.
    void propertyNotifiesOnChangeOnly_data()
    {
        QTest::addColumn<DataSource *>("source");
        QTest::addColumn<int>("index");
        const QList<DataSource *> all{PhoneSource::instance(),     EAPhoneSource::instance(),
                                      BluetoothSource::instance(), ProjectionSource::instance(),
                                      SpeechSource::instance(),    KeySource::instance(),
                                      NavSource::instance(),       GlobalSource::instance(),
                                      ArdelSource::instance()};
        for (DataSource *source : all) {
            const QMetaObject *meta = source->metaObject();
            for (int i = DataSource::staticMetaObject.propertyCount(); i < meta->propertyCount();
                 ++i)
                QTest::addRow("%s.%s", qPrintable(source->shortName()), meta->property(i).name())
                        << source << i;
        }
    }
    void propertyNotifiesOnChangeOnly()
    {
        QFETCH(DataSource *, source);
        QFETCH(int, index);
        const QMetaProperty meta = source->metaObject()->property(index);
        QCOMPARE(meta.notifySignal().name(), QByteArray(meta.name()) + "Changed");
        QCOMPARE(meta.notifySignal().parameterCount(), 1);

        QSignalSpy spy(source, meta.notifySignal());
        const QVariant current = meta.read(source);
        QVariant changed;
        switch (current.userType()) {
        case QMetaType::Bool:
            changed = !current.toBool();
            break;
        case QMetaType::Int:
            changed = current.toInt() + 7;
            break;
        case QMetaType::QString:
            changed = QString(current.toString() + QLatin1Char('5'));
            break;
        case QMetaType::QVariantList:
            changed = QVariantList(current.toList()) << QVariantMap{{QStringLiteral("text"), 1}};
            break;
        }
        QVERIFY2(changed.isValid(), meta.typeName());

        QVERIFY(source->setBridgeValue(QLatin1String(meta.name()), changed));
        QVERIFY(meta.write(source, changed)); // the same value again, through the plain setter
        QCOMPARE(spy.count(), 1);
        QCOMPARE(spy.at(0).at(0), changed);
        QCOMPARE(meta.read(source), changed);
    }

    // Transitions name these signals as strings; a misspelt or retyped signal only fails at run
    // time.
    void signalsTheModuleConnectsByName()
    {
        const QStringList signatures
                = QStringLiteral(
                          "phone statusChanged(int)|phone incomingCallChanged(bool)|"
                          "phone callNumberEnteredChanged(QString)|phone "
                          "recentCallListStatusChanged(int)|"
                          "phone messagesDownloadingStatusChanged(int)|phone "
                          "sendMessageStatusChanged(int)|"
                          "phone currentExtendedModeChanged(int)|phone "
                          "replyMessageLineNoChanged(int)|"
                          "phone smsTotalCountChanged(int)|phone totalUnreadSmsCountChanged(int)|"
                          "phone missedCallsPresent()|phone phoneDialingFailed(int)|"
                          "phone phoneCallAcceptingFailed()|phone "
                          "phoneIncomingCallRemoteRejection()|"
                          "phone phoneDriverDoorOpenLinkLossReconnectFailedReceived()|"
                          "phone phoneSiriSCOchannelNotActiveReceived()|phone "
                          "phonebookSearchReady()|"
                          "phone newTextMessageAlert()|phone smsPhoneDeclinedAccess()|"
                          "bluetooth deviceConnectedChanged(bool)|bluetooth "
                          "phoneDeviceChanged(int)|"
                          "projection projectionNotActive(bool)|projection "
                          "projectionDIONotActive(bool)|"
                          "speech displayPairingPopup()|key keyEvent(int, int)")
                          .split(QLatin1Char('|'));
        for (const QString &line : signatures) {
            const QString sourceName = line.section(QLatin1Char(' '), 0, 0);
            const QByteArray signature = QMetaObject::normalizedSignature(
                    qPrintable(line.section(QLatin1Char(' '), 1)));
            bool found = false;
            for (DataSource *source : DataSource::sources())
                found |= source->shortName() == sourceName
                        && source->metaObject()->indexOfSignal(signature.constData()) >= 0;
            QVERIFY2(found, qPrintable(line));
        }
    }

    // Commands and module-side setters, unchanged values too, with their arguments in order.
    void moduleCallsAreJournaledInOrder()
    {
        PhoneSource *phone = PhoneSource::instance();
        const qint64 since = TestSupport::mark();
        phone->dialNumber(QStringLiteral("0711"));
        phone->endCall();
        phone->downloadRecentCallsList(3);
        phone->retrySmsDownload();
        phone->dialRecentCall(2, 5);
        phone->setDriverRestrictedPhonebookModelMinRow(-1);
        phone->setDriverRestrictedPhonebookModelMinRow(-1);
        SpeechSource::instance()->cancelVRSession();
        QCOMPARE(TestSupport::bridgeCommandsSince(since).join(QLatin1Char(' ')),
                 QStringLiteral("phone.dialNumber(0711) phone.endCall() "
                                "phone.downloadRecentCallsList(3) phone.retrySmsDownload() "
                                "phone.dialRecentCall(2,5) "
                                "phone.setDriverRestrictedPhonebookModelMinRow(-1) "
                                "phone.setDriverRestrictedPhonebookModelMinRow(-1) "
                                "speech.cancelVRSession()"));
    }

    // The phone's side writes without journaling; reset brings back a head unit with no phone,
    // announcing only what changed.
    void bridgeSideAndReset()
    {
        PhoneSource *phone = PhoneSource::instance();
        BluetoothSource *bluetooth = BluetoothSource::instance();
        const qint64 since = TestSupport::mark();
        QVERIFY(phone->setBridgeValue(QStringLiteral("callNumberEntered"), QStringLiteral("112")));
        QVERIFY(phone->setBridgeValue(QStringLiteral("deviceBatteryLevel"), 3));
        QVERIFY(!phone->setBridgeValue(QStringLiteral("noSuchValue"), 1));
        QVERIFY(!phone->setBridgeValue(QStringLiteral("status"), QStringLiteral("seven")));
        bluetooth->setDeviceConnected(true);
        phone->AlphabetIndexModel()->setRows(
                {QVariantMap{{QStringLiteral("alphabet"), QStringLiteral("A")}}});
        phone->phoneBook()->setListLength(30);
        QSignalSpy key(KeySource::instance(), &KeySource::keyEvent);
        KeySource::instance()->sendKeyEvent(12, 2);
        QCOMPARE(key.count(), 1);
        QCOMPARE(key.at(0), (QVariantList{12, 2}));

        QSignalSpy battery(phone, &PhoneSource::deviceBatteryLevelChanged);
        QSignalSpy status(phone, &PhoneSource::statusChanged);
        resetAll();

        QCOMPARE(phone->deviceBatteryLevel(), -1);
        QCOMPARE(battery.count(), 1);
        QCOMPARE(status.count(), 0);
        QVERIFY(!bluetooth->deviceConnected());
        QVERIFY(phone->callNumberEntered().isEmpty());
        QCOMPARE(phone->AlphabetIndexModel()->count(), 0);
        QCOMPARE(phone->phoneBook()->listLength(), 0);
        QCOMPARE(TestSupport::bridgeCommandsSince(since), QStringList());
    }

    void listModels()
    {
        MultiDPListModel *alphabet = PhoneSource::instance()->AlphabetIndexModel();
        QSignalSpy countSpy(alphabet, &MultiDPListModel::countChanged);
        alphabet->setRows({QVariantMap{{QStringLiteral("alphabet"), QStringLiteral("A")}},
                           QVariantMap{{QStringLiteral("letterIndex"), -1}}});
        PhoneSource::instance()->phoneBook()->setListLength(60);

        QCOMPARE(alphabet->count(), 2);
        QCOMPARE(alphabet->rowCount(), 2);
        QCOMPARE(countSpy.count(), 1);
        QCOMPARE(alphabet->get(0, QStringLiteral("alphabet")).toString(), QStringLiteral("A"));
        QCOMPARE(alphabet->get(1, QStringLiteral("letterIndex")).toInt(), -1);
        QVERIFY(!alphabet->get(2, QStringLiteral("alphabet")).isValid());
        QVERIFY(!alphabet->get(0, QStringLiteral("letterIndex")).isValid());
        QCOMPARE(PhoneSource::instance()->phoneBook()->rowCount(), 60);
    }
};

QTEST_GUILESS_MAIN(TestMavrosk)
#include "tst_mavrosk.moc"
