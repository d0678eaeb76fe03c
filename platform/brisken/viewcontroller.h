#pragma once

#include <QObject>
#include <QString>
#include <QStringList>
#include <QVariant>

namespace Brisken {

// The GUI framework's view controller: the module's direct requests for views, popups and back
// navigation. Each request is recorded in the platform journal ("view-request", "popup-request",
// "popup-dismiss", "back") and handed to the HMI state machine, which shows what the states
// allow (journal "view", "popup-shown", "popup-hidden").
class ViewController : public QObject
{
    Q_OBJECT
public:
    static ViewController *instance();

    // Opens the popup state of that name (in its layer while the layer is active, over the screen
    // shown otherwise); a request that cannot be honoured is recorded as "popup-dropped".
    void requestPopup(const QString &viewId, const QVariant &data = QVariant());
    // Closes the popup, on top or covered; the next one still open shows.
    void dismissPopup(const QString &viewId);
    // The driver answered the popup with one of its buttons, after the button's controller call:
    // once the events posted so far have been handled, a popup whose closing the module leaves
    // to the framework (it has no transition of its own) closes if it is still open.
    void popupAnswered(const QString &viewId);
    // Enters the view state showing that view; for an identifier that no view state shows, the
    // state of that name (entered through its initial state). Anything else is only recorded.
    void showView(const QVariant &viewId, const QVariant &data = QVariant(), bool flag = false,
                  const QVariant &extra = QVariant());
    // Goes back `steps` views in the back stack of the views shown.
    void back(int steps = 1);

    // Queries for the host and tests.
    QString activeView() const; // the view identifier on screen, or empty
    QStringList shownPopups() const; // the popup on top of each active region
    QStringList openPopups() const; // every popup open, on top or covered
    QStringList backStack() const; // view state names, bottom first

private:
    explicit ViewController(QObject *parent = nullptr);
};

} // namespace Brisken
