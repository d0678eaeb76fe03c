// The phone's global popups and transitions as the host installs them: which, in which order, at
// which level, with which auto-dismiss time. The order of the lists is what the framework sees,
// and transitions that share a trigger are offered it in that order.

#include "globalhmi.h"
#include "hmiphoneglobalstatehandler.h"
#include "phone_cmp.h"

#include <quorvel/guardedpropertychangetransition.h>
#include <quorvel/guardedtransition.h>
#include <quorvel/hmiabstracttransition.h>
#include <quorvel/intsignaltransition.h>
#include <quorvel/keysignaltransition.h>
#include <quorvel/popupstate.h>

namespace {

// The global transition list, in registration order, as "source: trigger > target extras" (a
// source only for the transitions that keep theirs; extras: "exclN" the exclusive group N, "voice"
// a voice event) and the level.
struct ListedTransition
{
    const char *trigger;
    int level;
};

// clang-format off
const ListedTransition expectedTransitions[] = {
    {"key 12/2 > PHONE.Root", 3},
    {"key 12/2", 3},
    {"key 79/1", 3},
    {"key 80/1", 3},
    {"signal StatusBarController.statusBarVisibleChanged(bool)", 2},
    {"event HmiPhone_ShowContactsRequest > PhoneBookCmp", 2},
    {"PHONE.Root: event HmiPhone_AddPhoneRequest", 3},
    {"signal Speech.displayPairingPopup() voice", 3},
    {"event HmiPhone_EndCallRequest", 3},
    {"property Phone.incomingCall", 3},
    {"property Phone.incomingCall", 3},
    {"change Phone.status 3>7 excl0", 3},
    {"change Phone.status 4>9 excl0", 3},
    {"change Phone.status 5>10 excl0", 3},
    {"change Phone.status 6>11 excl0", 3},
    {"change Phone.privateMode *>1", 3},
    {"property Phone.status > PhoneCallCmp excl1", 3},
    {"change Phone.callConnected false>true", 3},
    {"key 77/1", 3},
    {"key 12/3", 3},
    {"key 12/3", 3},
    {"key 78/1", 3},
    {"key 49/1", 3},
    {"key 50/1", 3},
    {"key 90/2", 3},
    {"key 91/2", 3},
    {"key 90/3", 3},
    {"key 90/4", 3},
    {"key 91/3", 3},
    {"key 91/4", 3},
    {"key 12/2", 3},
    {"event HmiPhone_PhoneIssueFixRequest", 3},
    {"signal Phone.phoneDialingFailed(int)=1", 3},
    {"signal Phone.phoneDialingFailed(int)=0", 3},
    {"event HmiPhone_ConfirmRoamingCall", 3},
    {"event HmiPhone_CancelRoamingCall", 3},
    {"property Phone.deviceBatteryLevel", 3},
    {"event HmiPhone_ShowStatusBarAlertsRequest > PhoneStatusAlertsCmp", 3},
    {"event HmiPhone_StopAnswering", 3},
    {"property Phone.status excl0", 3},
    {"change Phone.status 12>* excl0", 3},
    {"signal Phone.nonUserDeviceDisconnectReceived()", 3},
    {"signal Phone.nonUserDeviceDisconnectReceived()", 3},
    {"signal Phone.newTextMessageAlert()", 3},
    {"signal Phone.phoneCallAcceptingFailed()", 3},
    {"signal Phone.newTextMessageDetailsReady()", 3},
    {"event HmiPhone_MakeCallRequest", 3},
    {"signal Phone.showMessageListRequested() > PhoneSmsCmp voice", 3},
    {"signal Phone.listenToMessageRequested()", 3},
    {"signal Phone.textMessageDetailsReady()", 3},
    {"signal Phone.newTextMessageAlert()", 3},
    {"signal Phone.showReplyMessagesRequested() > PhoneSmsReplyListViewState", 3},
    {"PhoneSmsReplyListViewState: event HmiPhoneSms_SendTextMessage", 3},
    {"signal Phone.replyMessageLineNoChanged(int)", 3},
    {"signal Phone.missedCallsPresent()", 3},
    {"event HmiPhoneSms_InitiateSendTextMessage", 3},
    {"PHONE.PhoneSmsSendTextMessageProgress: signal Phone.sendMessageStatusChanged(int)=2", 3},
    {"PHONE.PhoneSmsSendTextMessageProgress: signal Phone.sendMessageStatusChanged(int)=1", 3},
    {"PHONE.PhoneSmsSendTextMessageProgress: signal Phone.sendMessageStatusChanged(int)=3", 3},
    {"PHONE.PhoneSmsSendTextMessageProgress: signal Phone.sendMessageStatusChanged(int)=0", 3},
    {"event HmiPhoneSms_RetrySendTextMessage", 3},
    {"signal Phone.sendMessageRequested()", 3},
    {"signal Phone.cancelSendMessageRequested()", 3},
    {"change Phone.status *>3 excl0", 3},
    {"change Phone.status *>4 excl0", 3},
    {"signal Phone.multipartyActiveCallEnded()", 3},
    {"signal Phone.dtmfKeyPressNoResponseErrorReceived()", 3},
    {"signal Phone.phoneAudioTransferErrorReceived()", 3},
    {"PHONE.PhoneCallStandByModePopup: signal Phone.currentExtendedModeChanged(int)=1", 3},
    {"PHONE.PhoneCallStandByModePopup: event HmiPhone_PrivacyRequestOn", 3},
    {"PHONE.PhoneCallStandByModePopup: signal Phone.currentExtendedModeChanged(int)=2", 3},
    {"PHONE.PhoneCallStandByModePopup: signal Phone.currentExtendedModeChanged(int)=3", 3},
    {"PHONE.PhoneCallStandByModePopup: signal Phone.currentExtendedModeChanged(int)=0", 3},
    {"signal Phone.unstableDeviceConnectionWithKovaReceived()", 3},
    {"signal Phone.deviceReconnectFailReceived()", 3},
    {"signal Phone.phoneWaitingCallRemoteRejection()", 3},
    {"signal Phone.phoneIncomingCallRemoteRejection()", 3},
    {"signal Phone.phoneAudioHandsfreeErrorReceived()", 3},
    {"signal Phone.phoneRoamingModeReceived()", 3},
    {"signal Phone.phoneSiriNoResponseErrorReceived()", 3},
    {"signal Phone.phoneAudioInternalErrorReceived()", 3},
    {"signal Phone.phoneContactsTooLargeErrorReceived()", 3},
    {"change Phone.phoneBookStatus 2>1", 3},
    {"change Phone.phoneBookStatus *>2", 3},
    {"change Phone.phoneBookStatus 2>*", 3},
    {"signal Phone.phoneSmsNewTextClusterHearItRequestReceived()", 3},
    {"signal Phone.phoneSmsNewTextClusterIgnoreRequestReceived()", 3},
    {"signal Phone.phoneDriverDoorOpenLinkLossReconnectFailedReceived()", 3},
    {"signal Phone.phoneDriverDoorOpenLinkLossReconnectFailedReceived()", 3},
    {"event HmiPhone_ShowConnectToDevice > HmiPhone_Limbo", 3},
    {"change Bluetooth.deviceConnected false>true", 3},
    {"event HmiPhone_RetryPhnBookDownloadAccessRequest", 3},
    {"event HmiPhone_RetryAutomaticContactDownloadRequest", 3},
    {"PHONE.PhoneCallStandByModePopup: event HmiPhone_ClearExtendedModeTimer", 3},
    {"event HmiPhone_ShowSmsRequest", 3},
    {"event HmiPhone_ShowSmsRequest", 3},
    {"event HmiPhone_ShowSmsStatus > PhoneSmsCmp", 3},
    {"event HmiPhone_ShowSmsStatus", 3},
    {"event HmiPhone_RootStateRequest > PHONE.Root", 3},
    {"event HmiPhone_RoamingMode", 3},
    {"event HmiPhone_ShowSiriNotEnabledRequest", 3},
    {"signal Phone.phoneSiriSCOchannelNotActiveReceived()", 3},
    {"change Phone.siriActive false>true excl2", 2},
    {"change Phone.siriActive true>false", 2},
    {"change Phone.phoneVoiceServiceActive false>true excl2", 2},
    {"change Phone.phoneVoiceServiceActive true>false", 2},
    {"signal Bluetooth.deviceConnectedChanged(bool)", 3},
    {"signal HmiPhoneController.phoneMenuExited()", 2},
    {"signal HmiPhoneController.phoneMenuEntered()", 2},
    {"event HmiPhone_RejectIncomingCall", 3},
    {"event HmiPhone_AcceptIncomingCall", 3},
    {"event HmiPhone_ShowSmsIphoneRequest > PhoneSmsCmp", 3},
    {"signal Phone.sendMessageNoResponseFromPhoneAlert()", 3},
    {"signal Projection.projectionNotActive(bool)", 3},
    {"change Phone.doNotDisturb false>true", 3},
};

// The global popups in list order, all at level 3: view, auto-dismiss (0: until dismissed).
const QPair<const char *, int> expectedPopups[] = {
    {"MissedCallPopup", 5000}, {"IncomingCall", 0}, {"WaitingCall", 0}, {"Redial", 0},
    {"CallEnded", 3000}, {"DeviceIssueFixHint", 0}, {"NoCellularSignal", 3000},
    {"DialingFailed", 0}, {"Dialing3rdFailure", 0}, {"RoamingWarning", 0}, {"BatteryLow", 0},
    {"PhoneConnectionUnstable", 0}, {"PhoneConnectionLost", 0}, {"UnableToConnect", 0},
    {"HandsFreeError", 0}, {"CallAnswerNotResponding", 0}, {"NewTextMessageAlert1", 8000},
    {"NewTextMessageAlert2", 8000}, {"MultipleTextMessagesReceived", 8000},
    {"PhoneSmsSendTextMessage", 0}, {"PhoneSmsTextMessagingOff", 0},
    {"PhoneSmsSendTextMessageProgress", 0}, {"PhoneSmsSendTextMessageSuccess", 5000},
    {"PhoneSmsSendTextMessageFailure", 0}, {"PhoneSmsSendTextMessageNetworkFailure", 0},
    {"PhoneSmsRetrySendTextMessageFailure", 0}, {"PhoneSmsSendTextMessageNoResponseFromPhone", 0},
    {"DTMFKeyPressNoResponseErrorPopup", 3000}, {"PhoneAudioTransferErrorPopup", 5000},
    {"PhoneCallStandByModePopup", 0}, {"UnstableDeviceConnectionWithKovaPopup", 5000},
    {"SiriConnectionNotRespondingPopup", 3000}, {"ContactsListTooLargePopup", 0},
    {"siriFeatureNotEnabledPopup", 0}, {"PhoneVoiceServiceActivatedPopup", 0},
    {"PhoneBookDownloadComplete", 3000},
};
// clang-format on

QString shortClassName(const QObject *object)
{
    QString name = QLatin1String(object->metaObject()->className());
    name = name.mid(name.lastIndexOf(QLatin1Char(':')) + 1);
    if (name.endsWith(QLatin1String("Source")))
        name.chop(6);
    return name;
}

QString valueText(const QVariant &value)
{
    return value.isNull() ? QStringLiteral("*") : value.toString();
}

// What fires a transition, in the words of the table above.
QString describe(QAbstractTransition *transition)
{
    QString text;
    if (auto *key = qobject_cast<Quorvel::KeySignalTransition *>(transition)) {
        text = QStringLiteral("key %1/%2").arg(key->key()).arg(key->kind());
    } else if (auto *change
               = qobject_cast<Quorvel::GuardedPropertyChangeTransition *>(transition)) {
        QStringList from;
        for (const QVariant &value : change->fromValues())
            from.append(valueText(value));
        text = QStringLiteral("change %1.%2 %3>%4")
                       .arg(shortClassName(change->senderObject()),
                            QLatin1String(change->propertyName()),
                            from.isEmpty() ? QStringLiteral("*") : from.join(QLatin1Char(',')),
                            valueText(change->toValue()));
    } else if (auto *property = qobject_cast<Quorvel::GuardedPropertyTransition *>(transition)) {
        text = QStringLiteral("property %1.%2")
                       .arg(shortClassName(property->senderObject()),
                            QLatin1String(property->propertyName()));
    } else if (auto *signal = qobject_cast<Quorvel::HmiSignalTransition *>(transition)) {
        text = QStringLiteral("signal %1.%2")
                       .arg(shortClassName(signal->senderObject()),
                            QLatin1String(signal->signal()));
        if (auto *intSignal = qobject_cast<Quorvel::IntSignalTransition *>(transition))
            text += QStringLiteral("=%1").arg(intSignal->value());
    } else if (auto *event = qobject_cast<Quorvel::GuardedTransition *>(transition)) {
        text = QStringLiteral("event ") + event->eventName();
    } else {
        text = QLatin1String(transition->metaObject()->className());
    }
    if (transition->targetState())
        text += QStringLiteral(" > ") + transition->targetState()->objectName();
    // What the host reads of a transition besides its trigger: its exclusive group and the voice
    // flag.
    if (auto *hmi = qobject_cast<Quorvel::HmiAbstractTransition *>(transition)) {
        if (hmi->parallelExclusiveGroup() >= 0)
            text += QStringLiteral(" excl%1").arg(hmi->parallelExclusiveGroup());
        if (hmi->isVREventTransition())
            text += QStringLiteral(" voice");
    }
    const QAbstractState *source = transition->sourceState();
    if (source && source->objectName() != QLatin1String("AdoptedTransitions"))
        text.prepend(source->objectName() + QStringLiteral(": "));
    return text;
}

} // namespace

class TestGlobalStructure : public GlobalSuite
{
    Q_OBJECT

protected:
    void setUp() override
    {
        GlobalSuite::setUp();
        QVERIFY(m_hmi->setUp());
    }
private slots:
    void popupList();
    void transitionList();
    void guardsFindTheirTransitions();
    void activeStatesFollowOpenPopups_data();
    void activeStatesFollowOpenPopups();
};

void TestGlobalStructure::popupList()
{
    const auto popups = m_hmi->host().integration()->moduleRootHierarchyPopupStates();
    const int own = int(sizeof(expectedPopups) / sizeof(expectedPopups[0]));
    QVERIFY(popups.size() >= own);
    for (int i = 0; i < own; ++i) {
        const QString where = QStringLiteral("popup %1").arg(i + 1);
        Quorvel::PopupState *popup = popups.at(i).second;
        QVERIFY2(
                popup->viewId().endsWith(QLatin1Char('.') + QLatin1String(expectedPopups[i].first)),
                qPrintable(where + QStringLiteral(": ") + popup->viewId()));
        QCOMPARE(int(popups.at(i).first), 3);
        QCOMPARE(popup->priority(), 1);
        QCOMPARE(popup->autoDismissTimeoutActive(), expectedPopups[i].second > 0);
        if (expectedPopups[i].second > 0)
            QCOMPARE(popup->autoDismissTimeoutInterval(), expectedPopups[i].second);
    }

    // The root component's own popups follow, unchanged.
    auto *phoneCmp = qobject_cast<HmiPhone::Phone_Cmp *>(m_hmi->host().moduleRoot());
    QVERIFY(phoneCmp);
    QCOMPARE(popups.mid(own), phoneCmp->rootHierarchyPopups());
}

void TestGlobalStructure::transitionList()
{
    QStringList expected;
    for (const ListedTransition &row : expectedTransitions)
        expected.append(QStringLiteral("L%1 %2").arg(row.level).arg(QLatin1String(row.trigger)));
    const auto transitions = m_hmi->host().integration()->moduleRootHierarchyTransitions();
    QStringList actual;
    for (const auto &entry : transitions.mid(0, expected.size()))
        actual.append(QStringLiteral("L%1 %2").arg(int(entry.first)).arg(describe(entry.second)));
    QCOMPARE(actual, expected);

    auto *phoneCmp = qobject_cast<HmiPhone::Phone_Cmp *>(m_hmi->host().moduleRoot());
    QCOMPARE(transitions.mid(expected.size()), phoneCmp->rootHierarchyTransitions());
}

// Every guard asked once after the build: one that reads its transition from a handler field must
// find it there.
void TestGlobalStructure::guardsFindTheirTransitions()
{
    auto *handler
            = m_hmi->host().integration()->findChild<HmiPhone::HmiPhoneGlobalStateHandler *>();
    QVERIFY(handler);
    TestSupport::processUntilIdle(); // the warning guard takes its place once the run is going
    QList<QByteArray> missing;
    const QMetaObject *meta = handler->metaObject();
    for (int i = meta->methodOffset(); i < meta->methodCount(); ++i) {
        const QMetaMethod guard = meta->method(i);
        if (guard.methodType() != QMetaMethod::Slot || !guard.name().endsWith("Test"))
            continue;
        QVERIFY(guard.invoke(handler, Qt::DirectConnection, Q_ARG(QEvent *, nullptr)));
        if (!TestSupport::FrameworkWarningGuard::take().isEmpty())
            missing.append(guard.name());
    }
    QCOMPARE(missing, QList<QByteArray>());
}

// What the running machine costs follows the popups open, not those declared: with none open the
// whole HMI runs on a handful of active states, and each popup opened adds a few.
void TestGlobalStructure::activeStatesFollowOpenPopups_data()
{
    QTest::addColumn<int>("requested");
    for (int requested : {0, 1, 3})
        QTest::addRow("%d open", requested) << requested;
    QTest::addRow("all open") << -1;
}

void TestGlobalStructure::activeStatesFollowOpenPopups()
{
    QFETCH(int, requested);
    m_hmi->start();
    TestSupport::processUntilIdle();
    auto *machine = Quorvel::StateMachine::instance();
    const int idle = machine->configuration().size();
    QVERIFY2(idle <= 20, qPrintable(QString::number(idle)));
    const auto popups = m_hmi->host().integration()->moduleRootHierarchyPopupStates();
    for (int i = 0; i < (requested < 0 ? popups.size() : requested); ++i)
        machine->requestPopup(popups.at(i).second->viewId());
    TestSupport::processUntilIdle();
    // Opening one of the text-message alerts closes the other two.
    const int open = machine->openPopups().size();
    QVERIFY(open >= (requested < 0 ? popups.size() - 2 : requested));
    const int added = machine->configuration().size() - idle;
    QVERIFY2(added <= 5 * open,
             qPrintable(QStringLiteral("%1 open, %2 added").arg(open).arg(added)));
}

QTEST_GUILESS_MAIN(TestGlobalStructure)
#include "tst_globalstructure.moc"
