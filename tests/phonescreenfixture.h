#pragma once

// Builds the phone's screen tree under a test host state, as the integration does, without the
// global state machine: the phone screens' own transitions are then the only ones armed.

#include "testsupport.h"

#include <hmiphonecontroller.h>
#include <hmiphoneintegration.h>
#include <phone_cmp.h>

#include <journal/journal.h>
#include <mavrosk/datasource.h>
#include <quorvel/hmievent.h>
#include <quorvel/hmiviewstate.h>
#include <quorvel/statemachine.h>

#include <QAbstractState>

class PhoneScreenFixture
{
public:
    PhoneScreenFixture()
        : m_integration(new HmiPhone::HmiPhoneIntegration)
        , m_controller(new HmiPhone::HmiPhoneController(m_integration))
    { }
    ~PhoneScreenFixture()
    {
        Quorvel::StateMachine::destroyInstance();
        delete m_integration;
    }

    // Fresh data and journal; the machine is built by build(), after a test set its data.
    void reset()
    {
        Quorvel::StateMachine::destroyInstance();
        m_phone = nullptr;
        for (Mavrosk::DataSource *source : Mavrosk::DataSource::sources())
            source->reset();
        Platform::Journal::instance()->clear();
    }

    // The host's screens: a home view (initial) and the parent state of the phone.
    void build()
    {
        Quorvel::StateMachine *machine = Quorvel::StateMachine::instance();
        Quorvel::HmiState *screens = machine->screensState();
        m_home = new Quorvel::HmiViewState(QStringLiteral("TEST.Home"), QStringLiteral("Home"),
                                           screens);
        auto *parent = new Quorvel::HmiState(QStringLiteral("PhoneParent"), screens);
        screens->setInitialHmiState(m_home);
        m_phone = new HmiPhone::Phone_Cmp(m_integration, m_controller,
                                          m_integration->rootStateIdentifier(), parent);
        parent->setInitialHmiState(m_phone);
        machine->installRootHierarchy(m_phone->rootHierarchyTransitions(),
                                      m_phone->rootHierarchyPopups());
        machine->start();
        TestSupport::processUntilIdle();
        m_since = Platform::Journal::instance()->lastSequence();
    }

    void enter(QAbstractState *state)
    {
        Quorvel::StateMachine::instance()->goToState(state);
        TestSupport::processUntilIdle();
    }

    void post(const QString &name, const QVariant &value = QVariant())
    {
        Quorvel::StateMachine::instance()->postEvent(new Quorvel::HmiEvent(name, value));
        TestSupport::processUntilIdle();
    }

    // Starts a new stretch of the journal: the checks below read what came after.
    void mark() { m_since = Platform::Journal::instance()->lastSequence(); }

    bool isActive(const QString &stateName) const
    {
        const auto configuration = Quorvel::StateMachine::instance()->configuration();
        for (const QAbstractState *state : configuration) {
            if (state->objectName() == stateName)
                return true;
        }
        return false;
    }

    // The data-bridge commands since the mark, as "source.member(arg, ...)".
    QStringList bridgeCalls() const
    {
        QStringList calls;
        for (const auto &entry : Platform::Journal::instance()->entriesSince(m_since)) {
            if (entry.kind != QLatin1String("bridge"))
                continue;
            QStringList args;
            for (const QVariant &arg : entry.fields.value(QStringLiteral("args")).toList())
                args.append(arg.toString());
            calls.append(entry.fields.value(QStringLiteral("call")).toString() + QLatin1Char('(')
                         + args.join(QStringLiteral(", ")) + QLatin1Char(')'));
        }
        return calls;
    }

    QStringList journal(const QString &kind, const QString &field = QStringLiteral("id")) const
    {
        return TestSupport::journalValues(kind, field, m_since);
    }

    HmiPhone::Phone_Cmp *phone() const { return m_phone; }
    Quorvel::HmiViewState *home() const { return m_home; }
    HmiPhone::HmiPhoneIntegration *integration() const { return m_integration; }

private:
    HmiPhone::HmiPhoneIntegration *m_integration;
    HmiPhone::HmiPhoneController *m_controller;
    HmiPhone::Phone_Cmp *m_phone = nullptr;
    Quorvel::HmiViewState *m_home = nullptr;
    qint64 m_since = 0;
};
