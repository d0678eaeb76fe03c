#pragma once

// The builder of the global transition chart, private to the global state handler. One chained
// statement builds one chart row:
//
//     chart.property(m_phoneSource, "incomingCall")        trigger and kind (source: last argument)
//             .keep(m_incomingCallTransition)               the handler field it is kept in
//             .guard(&H::incomingCallTransitionEventTest)   the handler's guard slot
//             .run(&H::incomingCall)                        slots on triggered(), in order
//             .list(10);                                    place in the root-hierarchy list
//
// A row without list() is not handed to the framework (it has a source state). Statements run in
// the order they are written, which is the order of creation: transitions that share a trigger are
// offered it in that order. The list order is only the one the list() values give.

#include "hmiphoneglobalstatehandler.h"
#include "hmiphoneintegration.h"

#include <mavrosk/keysource.h>
#include <quorvel/guardedpropertychangetransition.h>
#include <quorvel/guardedpropertytransition.h>
#include <quorvel/guardedsignaltransition.h>
#include <quorvel/hmisignaltransition.h>
#include <quorvel/hmitransition.h>
#include <quorvel/intsignaltransition.h>
#include <quorvel/keysignaltransition.h>
#include <quorvel/popupstate.h>

#include <QMap>

namespace HmiPhone {

class GlobalChart
{
public:
    using Handler = HmiPhoneGlobalStateHandler;

    template<class Transition> class Row
    {
    public:
        Row(GlobalChart *chart, Transition *transition)
            : m_chart(chart)
            , m_transition(transition)
        { }

        Row to(QAbstractState *target) const
        {
            m_transition->setTargetState(target);
            return *this;
        }
        // Stores the transition in the handler field its guard or its slots reach it through.
        template<class Field> Row keep(Field *&field) const
        {
            field = m_transition;
            return *this;
        }
        template<class Test> Row guard(Test test) const
        {
            QObject::connect(m_transition, &Quorvel::HmiAbstractTransition::transitionTest,
                             m_chart->m_handler, test);
            return *this;
        }
        // A slot of the handler, or a request object of the framework.
        template<class Slot> Row run(Slot slot) const
        {
            QObject::connect(m_transition, &QAbstractTransition::triggered, m_chart->m_handler,
                             slot);
            return *this;
        }
        template<class Receiver, class Slot> Row run(Receiver *receiver, Slot slot) const
        {
            QObject::connect(m_transition, &QAbstractTransition::triggered, receiver, slot);
            return *this;
        }
        // The slot runs after the machine has handled the events posted while this transition and
        // those fired with it ran (a queued connection): a popup closed this way still takes the
        // answer another key row posted to it.
        template<class Receiver, class Slot> Row runLater(Receiver *receiver, Slot slot) const
        {
            QObject::connect(m_transition, &QAbstractTransition::triggered, receiver, slot,
                             Qt::QueuedConnection);
            return *this;
        }
        Row parallelExclusive(int group) const
        {
            m_transition->makeParallelExclusive(group);
            return *this;
        }
        Row voiceEvent() const
        {
            m_transition->setIsVREventTransition(true, QVariant());
            return *this;
        }
        // The popup closes when this transition fires.
        Row dismisses(Quorvel::PopupState *popup) const
        {
            popup->registerDismissingTransition(m_transition);
            return *this;
        }
        Row list(int position, Quorvel::StateLevel level = Quorvel::StateLevel3) const
        {
            m_chart->list(position, level, m_transition);
            return *this;
        }
        Transition *transition() const { return m_transition; }

    private:
        GlobalChart *m_chart;
        Transition *m_transition;
    };

    GlobalChart(Handler *handler, Mavrosk::KeySource *keySource)
        : m_handler(handler)
        , m_keySource(keySource)
    { }

    // The kinds of transition, by trigger.
    Row<Quorvel::HmiTransition> event(const QString &name, QState *source = nullptr)
    {
        return row(new Quorvel::HmiTransition(name, source));
    }
    template<class Sender, class Signal>
    Row<Quorvel::HmiSignalTransition> signal(Sender *sender, Signal signal,
                                             QState *source = nullptr)
    {
        return row(new Quorvel::HmiSignalTransition(sender, signal, source));
    }
    template<class Sender, class Signal>
    Row<Quorvel::IntSignalTransition> intSignal(Sender *sender, Signal signal, int value,
                                                QState *source = nullptr)
    {
        return row(new Quorvel::IntSignalTransition(sender, signal, value, source));
    }
    template<class Sender, class Signal>
    Row<Quorvel::GuardedSignalTransition> guardedSignal(Sender *sender, Signal signal,
                                                        QState *source = nullptr)
    {
        return row(new Quorvel::GuardedSignalTransition(sender, signal, source));
    }
    // Fires on every change notification of the property.
    Row<Quorvel::GuardedPropertyTransition> property(QObject *sender, const char *name,
                                                     QState *source = nullptr)
    {
        return row(new Quorvel::GuardedPropertyTransition(sender, name, source));
    }
    // Fires when the property changes from one of `from` (any value when empty) to `to` (any
    // other value when null).
    Row<Quorvel::GuardedPropertyChangeTransition> change(QObject *sender, const char *name,
                                                         const QVariantList &from,
                                                         const QVariant &to,
                                                         QState *source = nullptr)
    {
        return row(new Quorvel::GuardedPropertyChangeTransition(sender, name, from, to, source));
    }
    Row<Quorvel::KeySignalTransition> key(int code, int kind, QState *source = nullptr)
    {
        return row(new Quorvel::KeySignalTransition(m_keySource, "2keyEvent(int, int)", code, kind,
                                                    source));
    }

    // The listed transitions in list order.
    HmiPhoneGlobalStateHandler::TransitionList listed() const { return m_listed.values(); }

private:
    template<class Transition> Row<Transition> row(Transition *transition)
    {
        return Row<Transition>(this, transition);
    }
    void list(int position, Quorvel::StateLevel level, QAbstractTransition *transition)
    {
        if (m_listed.contains(position))
            qCCritical(hmiphone())
                    << "Global transition list: position" << position << "given twice";
        m_listed.insert(position, qMakePair(level, transition));
    }

    Handler *m_handler;
    Mavrosk::KeySource *m_keySource;
    QMap<int, QPair<Quorvel::StateLevel, QAbstractTransition *>> m_listed;
};

} // namespace HmiPhone
