#pragma once

#include <QJsonObject>
#include <QString>

namespace Simulator {

// One line of a scenario (JSON Lines): an input to the module, a move of the virtual clock or a
// check of what the module did.
struct ScenarioStep
{
    enum Kind {
        Invalid,
        Set, // {"set": "phone.status", "value": 7}; host.displayContext, host.statusBarVisible ...
        Emit, // {"emit": "phone.missedCallsPresent", "args": []}
        Key, // {"key": 12, "kind": 2}
        Call, // {"call": "acceptIncomingCall", "args": []}
        Intent, // {"intent": 1, "args": ["0123456789"]}
        Post, // {"post": "HmiPhone_RootStateRequest", "value": null}
        Open, // {"open": "phone"} or {"open": "home"}
        Back, // {"back": 1}
        Model, // {"model": "phone.phoneBook", "length": 60} or "rows": [...]
        Advance, // {"advance": 3000}
        Start, // {"start": true}
        Expect, // {"expect": {...}}
        ExpectNot, // {"expect-not": {...}}
    };

    Kind kind = Invalid;
    int line = 0;
    QString text; // the line as written, without surrounding blanks
    QJsonObject object; // the whole step
    QString error; // why the line is not a step (kind Invalid)

    // Whether the step gives the module something to react to (everything but the checks):
    // "out" checks look at the outputs written since the last such step.
    bool isInput() const { return kind != Expect && kind != ExpectNot && kind != Invalid; }

    // Reads one line; returns false for a line to skip (blank or a comment starting with '#').
    static bool parse(const QString &text, int line, ScenarioStep *step);
};

} // namespace Simulator
