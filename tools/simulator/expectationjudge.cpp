#include "expectationjudge.h"

#include "scenarioreader.h"
#include "scenariostep.h"

#include <brisken/datastore.h>
#include <brisken/statusbarcontroller.h>
#include <brisken/viewcontroller.h>
#include <mavrosk/bridge.h>
#include <quorvel/popupstate.h>
#include <quorvel/statemachine.h>

#include <QAbstractState>
#include <QJsonArray>
#include <QJsonDocument>

namespace Simulator {

namespace {

// Checks whose value is a name of what is on screen, not a value name.
const char *const ScreenChecks[] = {"view", "popup", "nopopup", "top", "state"};

// The framework's places for popups in a region (a leaf below a region and above any popup) say
// nothing about what is shown.
bool isPopupPlace(const QAbstractState *state, const QList<QState *> &regions)
{
    for (const QObject *each = state; each; each = each->parent()) {
        if (qobject_cast<const Quorvel::PopupState *>(each))
            return false;
        if (regions.contains(static_cast<QState *>(const_cast<QObject *>(each))))
            return true;
    }
    return false;
}

QString compact(const QJsonObject &object)
{
    return QString::fromUtf8(QJsonDocument(object).toJson(QJsonDocument::Compact));
}

QString compact(const QJsonValue &value)
{
    const QString wrapped
            = QString::fromUtf8(QJsonDocument(QJsonArray{value}).toJson(QJsonDocument::Compact));
    return wrapped.mid(1, wrapped.size() - 2);
}

bool isScreenCheck(const QString &key)
{
    for (const char *check : ScreenChecks) {
        if (key == QLatin1String(check))
            return true;
    }
    return false;
}

// An identifier written in a scenario matches the platform's full one ("IncomingCall" matches
// "PHONE.IncomingCall", "acceptIncomingCall" matches "phone.acceptIncomingCall").
bool namesMatch(const QString &actual, const QString &expected)
{
    return !expected.isEmpty()
            && (actual == expected || actual.endsWith(QLatin1Char('.') + expected));
}

bool valuesMatch(const QJsonValue &actual, const QJsonValue &expected)
{
    if (actual.isString() && expected.isString())
        return namesMatch(actual.toString(), expected.toString());
    return actual == expected;
}

// The bridge's list models by name; a check of one compares its number of rows.
QAbstractItemModel *listModel(const QString &name)
{
    return Mavrosk::listModel(name);
}

bool readValue(const QString &name, QObject *controller, QVariant *value, QString *error)
{
    if (QAbstractItemModel *model = listModel(name)) {
        *value = model->rowCount();
        return true;
    }
    if (name == QLatin1String("host.transients")) {
        auto *statusBar = Brisken::DataStore::get<Brisken::StatusBarController>(
                QStringLiteral("StatusBarController"));
        *value = statusBar ? statusBar->transientWidgets() : QStringList();
        return true;
    }
    if (name == QLatin1String("host.statusBarVisible")
        && !Brisken::DataStore::get(QStringLiteral("StatusBarController"))) {
        *error = QStringLiteral("the host runs without a status bar");
        return false;
    }
    const NamedValue named = ScenarioReader::resolve(name, controller);
    if (!named.isValid()) {
        *error = named.error;
        return false;
    }
    *value = named.property.read(named.object);
    return true;
}

QString checkScreen(const QString &key, const QString &wanted, bool negated)
{
    const QString no = negated ? QStringLiteral("no ") : QString();
    if (key == QLatin1String("view")) {
        const QString active = Brisken::ViewController::instance()->activeView();
        if (namesMatch(active, wanted) != negated)
            return QString();
        return QStringLiteral("expected %1view %2, on screen: %3")
                .arg(no, wanted, active.isEmpty() ? QStringLiteral("none") : active);
    }
    // "popup"/"nopopup": open, on top or covered; "top": shown on top of its region.
    if (key == QLatin1String("popup") || key == QLatin1String("nopopup")
        || key == QLatin1String("top")) {
        const bool top = key == QLatin1String("top");
        Brisken::ViewController *views = Brisken::ViewController::instance();
        const QStringList popups = top ? views->shownPopups() : views->openPopups();
        bool found = false;
        for (const QString &popup : popups)
            found = found || namesMatch(popup, wanted);
        const bool wanting = (key != QLatin1String("nopopup")) != negated;
        if (found == wanting)
            return QString();
        return QStringLiteral("expected %1%2 %3, %4: %5")
                .arg(wanting ? QString() : QStringLiteral("no "),
                     top ? QStringLiteral("popup on top") : QStringLiteral("open popup"), wanted,
                     top ? QStringLiteral("on top") : QStringLiteral("open"),
                     popups.isEmpty() ? QStringLiteral("none") : popups.join(QStringLiteral(", ")));
    }
    // "state": an active state of that object name; the message lists the active leaves.
    QStringList active;
    bool found = false;
    if (auto *machine = Quorvel::StateMachine::existingInstance()) {
        const QList<QState *> regions = machine->popupRegions();
        for (QAbstractState *state : machine->findChildren<QAbstractState *>()) {
            if (!state->active())
                continue;
            if (state->objectName() == wanted)
                found = true;
            bool activeChild = false;
            for (QAbstractState *child :
                 state->findChildren<QAbstractState *>(QString(), Qt::FindDirectChildrenOnly))
                activeChild = activeChild || child->active();
            if (!activeChild && !isPopupPlace(state, regions))
                active.append(state->objectName());
        }
    }
    if (found != negated)
        return QString();
    return QStringLiteral("expected %1active state %2, active leaves: %3")
            .arg(no, wanted, active.join(QStringLiteral(", ")));
}

QString checkValue(const QString &key, const QJsonValue &expected, bool negated,
                   QObject *controller)
{
    QVariant value;
    QString error;
    if (!readValue(key, controller, &value, &error))
        return error;
    const QJsonValue actual = QJsonValue::fromVariant(value);
    if ((actual == expected) != negated)
        return QString();
    return QStringLiteral("expected %1 %2%3, is %4")
            .arg(key, negated ? QStringLiteral("not ") : QString(), compact(expected),
                 compact(actual));
}

QString checkOutput(const QJsonObject &expected, bool negated, const QList<Output> &outputs)
{
    const QString kind = expected.value(QLatin1String("out")).toString();
    QStringList seen;
    bool found = false;
    for (const Output &output : outputs) {
        if (output.kind != kind)
            continue;
        seen.append(OutputWriter::details(output));
        bool matches = true;
        for (auto it = expected.constBegin(); it != expected.constEnd() && matches; ++it) {
            if (it.key() == QLatin1String("out"))
                continue;
            matches = valuesMatch(QJsonValue::fromVariant(output.fields.value(it.key())),
                                  it.value());
        }
        found = found || matches;
    }
    if (found != negated)
        return QString();
    QJsonObject fields = expected;
    fields.remove(QLatin1String("out"));
    return QStringLiteral("expected %1%2 output %3 since the last input; %4")
            .arg(negated ? QStringLiteral("no ") : QString(), kind, compact(fields),
                 seen.isEmpty() ? QStringLiteral("there was none of its kind")
                                : QStringLiteral("written: ") + seen.join(QStringLiteral("; ")));
}

} // namespace

QString ExpectationJudge::checkNames(const QJsonObject &checks, QObject *controller)
{
    if (checks.contains(QLatin1String("out"))) {
        if (!checks.value(QLatin1String("out")).isString())
            return QStringLiteral("\"out\" names a kind of output");
        return QString();
    }
    for (auto it = checks.constBegin(); it != checks.constEnd(); ++it) {
        const QString &key = it.key();
        if (isScreenCheck(key)) {
            if (!it.value().isString() || it.value().toString().isEmpty())
                return QStringLiteral("\"%1\" names what is on screen").arg(key);
            continue;
        }
        if (key.startsWith(QLatin1String("host."))) {
            if (key != QLatin1String("host.transients")
                && key != QLatin1String("host.displayContext")
                && key != QLatin1String("host.statusBarVisible"))
                return QStringLiteral("unknown value %1").arg(key);
            continue;
        }
        if (!key.contains(QLatin1Char('.')))
            return QStringLiteral("unknown check \"%1\"").arg(key);
        if ((key.startsWith(QLatin1String("controller.")) && !controller) || listModel(key))
            continue;
        const NamedValue named = ScenarioReader::resolve(key, controller);
        if (!named.isValid())
            return named.error;
    }
    return QString();
}

ExpectationJudge::Verdict ExpectationJudge::judge(const ScenarioStep &step,
                                                  const QList<Output> &outputs, QObject *controller)
{
    const bool negated = step.kind == ScenarioStep::ExpectNot;
    const QJsonObject checks = step.value(negated ? "expect-not" : "expect").toObject();
    Verdict verdict;
    if (checks.contains(QLatin1String("out"))) {
        verdict.checks = 1;
        const QString message = checkOutput(checks, negated, outputs);
        if (!message.isEmpty())
            verdict.failures.append(message);
        return verdict;
    }
    for (auto it = checks.constBegin(); it != checks.constEnd(); ++it) {
        ++verdict.checks;
        const QString message = isScreenCheck(it.key())
                ? checkScreen(it.key(), it.value().toString(), negated)
                : checkValue(it.key(), it.value(), negated, controller);
        if (!message.isEmpty())
            verdict.failures.append(message);
    }
    return verdict;
}

} // namespace Simulator
