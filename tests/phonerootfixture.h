#pragma once

// The phone's root component built as the integration builds it, under the shared test host but
// without the global state machine: only the phone screens' own transitions are armed.

#include "screenfixture.h"

#include <hmiphonecontroller.h>
#include <hmiphoneintegration.h>
#include <phone_cmp.h>

namespace PhoneRootFixture {

// Writes bridge values as the phone's side would, given as "source.property=value ...".
inline void setValues(const QString &values)
{
    for (const QString &value : values.split(QLatin1Char(' '), Qt::SkipEmptyParts))
        QVERIFY2(TestSupport::setBridgeValue(value), qPrintable(value));
}

// A fresh host with the data `values`, the phone built under it and the machine started.
inline HmiPhone::Phone_Cmp *build(const QString &values = {})
{
    static auto *integration = new HmiPhone::HmiPhoneIntegration;
    static auto *controller = new HmiPhone::HmiPhoneController(integration);
    Quorvel::HmiState *parent = ScreenFixture::buildRoot();
    setValues(values);
    auto *phone = new HmiPhone::Phone_Cmp(integration, controller,
                                          integration->rootStateIdentifier(), parent);
    parent->setInitialHmiState(phone);
    Quorvel::StateMachine::instance()->installRootHierarchy(phone->rootHierarchyTransitions(),
                                                            phone->rootHierarchyPopups());
    ScreenFixture::start();
    return phone;
}

inline void enter(QAbstractState *state)
{
    Quorvel::StateMachine::instance()->goToState(state);
    TestSupport::processUntilIdle();
}

// What the HMI was asked for since `since`, in order: bridge commands (without the setters of
// other screens), popups requested, back steps, posted events and intents.
inline QStringList outputs(qint64 since)
{
    QStringList result;
    const QStringList kinds{QStringLiteral("bridge"), QStringLiteral("popup-request"),
                            QStringLiteral("back"), QStringLiteral("event"),
                            QStringLiteral("intent")};
    for (const QString &line : TestSupport::journalLines(since, kinds)) {
        if (!line.section(QLatin1Char('.'), 1).startsWith(QLatin1String("set")))
            result.append(line);
    }
    return result;
}

} // namespace PhoneRootFixture
