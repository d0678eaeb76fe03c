#pragma once

#include "outputwriter.h"

#include <QJsonObject>
#include <QList>
#include <QString>
#include <QStringList>

class QObject;

namespace Simulator {

struct ScenarioStep;

// Judges a scenario's expectations against what the HMI shows now and what the module wrote
// since the last input step:
//   "view", "popup", "nopopup", "top", "state": what is on screen (a popup is open, on top or
//   covered; "top" is the popup shown on top of its region) and which states are active;
//   a value name ("phone.status", "controller.isEmptyNumber", "host.transients"): its value;
//   a list model ("phone.phoneBook", "phone.recentCallList", "phone.textMessageList",
//   "phone.AlphabetIndexModel"): its number of rows;
//   "out" with fields: an output of that kind written since the last input.
// An "expect-not" step negates each of its checks.
class ExpectationJudge
{
public:
    // Why the checks of an expectation cannot be judged (an unknown check or value name, a
    // check that is not a string); empty when they can. `controller` null: its names pass.
    static QString checkNames(const QJsonObject &checks, QObject *controller);

    // The checks of one expectation step: how many there were and a message for each that
    // failed. `outputs`: the outputs written since the last input step.
    struct Verdict
    {
        int checks = 0;
        QStringList failures;
    };
    static Verdict judge(const ScenarioStep &step, const QList<Output> &outputs,
                         QObject *controller);
};

} // namespace Simulator
