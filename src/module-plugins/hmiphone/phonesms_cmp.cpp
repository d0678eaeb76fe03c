#include "phonesms_cmp.h"

#include "hmiphoneevents.h"
#include "hmiphonepopupmanager.h"
#include "hmiphoneviews.h"

#include <brisken/requestview.h>
#include <mavrosk/phonesource.h>
#include <quorvel/guardedpropertychangetransition.h>
#include <quorvel/guardedsignaltransition.h>
#include <quorvel/hmisignaltransition.h>
#include <quorvel/hmitargetblacklistfilter.h>
#include <quorvel/hmitransition.h>
#include <quorvel/hmiviewstate.h>

#include <QEvent>
#include <QSharedPointer>

namespace HmiPhone {

namespace {

// The message index carried by a selection event; a message list has no negative rows.
bool messageIndex(const QVariant &data, int *index)
{
    if (!data.isValid())
        return false;
    bool ok = false;
    const int value = data.toInt(&ok);
    if (!ok || value < 0)
        return false;
    *index = value;
    return true;
}

} // namespace

PhoneSms_Cmp::PhoneSms_Cmp(const QString &name, Quorvel::HmiState *parent)
    : Quorvel::HmiLayeredState(name, parent)
    , m_phoneSource(Mavrosk::PhoneSource::instance())
{
    m_listView = new Quorvel::HmiViewState(Views::PhoneSmsList,
                                           QStringLiteral("PhoneSmsListViewState"), this);
    m_listView->setHandlesBackEvent(true);
    m_replyView = new Quorvel::HmiViewState(Views::PhoneSmsReplyView,
                                            QStringLiteral("PhoneSmsReplyListViewState"), this);
    m_replyView->setHandlesBackEvent(true);
    m_messageView = new Quorvel::HmiViewState(Views::PhoneSmsView,
                                              QStringLiteral("PhoneSmsViewState"), this);
    m_messageView->setHandlesBackEvent(true);

    // Going back from the list never lands on the reply texts.
    m_listView->addBackTargetFilter(QSharedPointer<Quorvel::HmiTargetFilter>(
            new Quorvel::HmiTargetBlacklistFilter(QStringLiteral("PhoneSmsReplyListViewState"))));

    m_messageOptionsTransition
            = new Quorvel::HmiTransition(Events::HmiPhoneSms_ViewTextMessageOptions, m_listView);
    connect(m_messageOptionsTransition, &QAbstractTransition::triggered, this,
            &PhoneSms_Cmp::handleViewTextMessageOptions);

    m_hearSelectedTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_HearSelectedTextMessage, m_listView);
    connect(m_hearSelectedTransition, &QAbstractTransition::triggered, this,
            &PhoneSms_Cmp::handleHearSelectedTextMessage);

    // The details belong to the list: they arrive after a selection made there.
    m_detailsReadyTransition = new Quorvel::HmiSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::textMessageDetailsReady, m_listView);
    connect(m_detailsReadyTransition, &QAbstractTransition::triggered, this,
            &PhoneSms_Cmp::handleTextMessageDetailsReady);

    auto *refreshTransition = new Quorvel::HmiTransition(Events::HmiPhoneSms_RefreshMessages, this);
    connect(refreshTransition, &QAbstractTransition::triggered, this,
            &PhoneSms_Cmp::handleRefreshMessages);

    auto *replyTransition
            = new Quorvel::HmiTransition(Events::HmiPhoneSms_ReplyTextMessage, m_messageView);
    replyTransition->setTargetState(m_replyView);

    auto *hearTransition
            = new Quorvel::HmiTransition(Events::HmiPhoneSms_HearTextMessage, m_messageView);
    connect(hearTransition, &QAbstractTransition::triggered, this,
            &PhoneSms_Cmp::handleHearTextMessage);

    auto *hearReplyTransition
            = new Quorvel::HmiTransition(Events::HmiPhone_HearSelectedReplyMessage, m_replyView);
    connect(hearReplyTransition, &QAbstractTransition::triggered, this,
            &PhoneSms_Cmp::handleHearSelectedReplyMessage);

    connect(m_listView, &QAbstractState::entered, this, &PhoneSms_Cmp::onSmsListEntry);

    m_newMessageTransition = new Quorvel::GuardedSignalTransition(
            m_phoneSource, &Mavrosk::PhoneSource::newTextMessageAlert, m_listView);
    connect(m_newMessageTransition, &Quorvel::GuardedSignalTransition::transitionTest, this,
            &PhoneSms_Cmp::phnSmsRequestInboxForceTest);
    connect(m_newMessageTransition, &QAbstractTransition::triggered, this,
            &PhoneSms_Cmp::phnSmsRequestInboxForce);

    auto *inboxFilledTransition = new Quorvel::GuardedPropertyChangeTransition(
            m_phoneSource, "messagesInboxEmptyStatus", QVariantList{true}, false, m_listView);
    connect(inboxFilledTransition, &QAbstractTransition::triggered, this,
            &PhoneSms_Cmp::phnSmsRequestInbox);

    setInitialHmiState(m_listView);
}

void PhoneSms_Cmp::handleViewTextMessageOptions()
{
    int index = 0;
    if (messageIndex(m_messageOptionsTransition->transitionData(), &index))
        m_phoneSource->requestSelectedTextMessageDetails(index);
    // Opening the message is what was asked last: the details must not be read aloud.
    m_hearWhenReady = false;
}

void PhoneSms_Cmp::handleRefreshMessages()
{
    HmiPhonePopupManager::instance()->showMessagesDownloading();
    m_phoneSource->retrySmsDownload();
}

void PhoneSms_Cmp::handleHearTextMessage()
{
    m_phoneSource->textMessagePlayback(m_phoneSource->textMessageBody());
}

void PhoneSms_Cmp::handleHearSelectedTextMessage()
{
    int index = 0;
    if (!messageIndex(m_hearSelectedTransition->transitionData(), &index))
        return;
    m_hearWhenReady = true;
    m_phoneSource->requestSelectedTextMessageDetails(index);
}

void PhoneSms_Cmp::handleTextMessageDetailsReady()
{
    if (m_hearWhenReady) {
        m_hearWhenReady = false;
        m_phoneSource->textMessagePlayback(m_phoneSource->textMessageBody());
        return;
    }
    Brisken::RequestView(m_messageView, QVariant(), false, QVariant())();
}

void PhoneSms_Cmp::handleHearSelectedReplyMessage()
{
    m_phoneSource->textMessagePlayback(m_phoneSource->replyTextSelected());
}

void PhoneSms_Cmp::phnSmsRequestInboxForceTest(QEvent *event)
{
    Q_UNUSED(event)
    // No forced request while a download is running: the download brings the inbox.
    m_newMessageTransition->setAllowTransition(m_phoneSource->messagesDownloadingStatus() != 2);
}

void PhoneSms_Cmp::onSmsListEntry()
{
    if (!m_phoneSource->messagesInboxEmptyStatus())
        emit phnSmsRequestInbox();
}

} // namespace HmiPhone
