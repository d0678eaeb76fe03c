#pragma once

#include <QByteArray>
#include <QJsonObject>
#include <QString>

namespace Simulator {

// One line of a scenario (JSON Lines): an input to the module, a move of the virtual clock or a
// check of what the module did.
struct ScenarioStep
{
    enum Kind {
        Invalid,
        Comment, // a blank line or one starting with '#': only echoed
        Set, // {"set": "phone.status", "value": 7}; host.displayContext, host.statusBarVisible ...
        Emit, // {"emit": "phone.missedCallsPresent", "args": []}
        Key, // {"key": 12, "kind": 2}
        Call, // {"call": "acceptIncomingCall", "args": []}
        // The driver answers an open popup with its button: the button's controller call, if
        // any, then the framework closes the popup if the module leaves that to it.
        Answer, // {"answer": "PHONE.RoamingWarning", "call": "confirmRoamingCall", "args": []}
        Intent, // {"intent": 1, "args": ["0123456789"]}
        Post, // {"post": "HmiPhone_RootStateRequest", "value": null}
        Open, // {"open": "phone"}, "home", "settings" or "settings/Phone" (a settings entry)
        Back, // {"back": 1}
        Model, // {"model": "phone.phoneBook", "length": 60} or "rows": [...]
        Advance, // {"advance": 3000}
        Start, // {"start": true}
        Expect, // {"expect": {...}}
        ExpectNot, // {"expect-not": {...}}
    };

    // The most virtual time one step may let pass: a year.
    static constexpr qint64 MaximumAdvance = 365LL * 24 * 60 * 60 * 1000;
    // The most back steps one step may take.
    static constexpr int MaximumBack = 1000;

    Kind kind = Invalid;
    int line = 0;
    QString text; // the line as written, without surrounding blanks
    QJsonObject object; // the whole step
    QString error; // why the line is not a step (kind Invalid)

    // Whether the step gives the module something to react to (everything but the checks):
    // "out" checks look at the outputs written since the last such step.
    bool isInput() const
    {
        return kind != Expect && kind != ExpectNot && kind != Invalid && kind != Comment;
    }
    bool isCheck() const { return kind == Expect || kind == ExpectNot; }

    // The step's name field ("set", "emit", "call", ...) and the value under it.
    QString name() const;
    QJsonValue value(const char *key) const { return object.value(QLatin1String(key)); }

    // Reads one line as written in a file (UTF-8): its JSON, its kind and the shape and types of
    // its fields. Names are checked later against the hosted module (ScenarioReader). A line that
    // is not a step has kind Invalid and says why in `error`.
    static ScenarioStep parse(const QByteArray &line, int lineNumber);
};

} // namespace Simulator
