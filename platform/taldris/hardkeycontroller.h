#pragma once

#include <QObject>

namespace Taldris {

// The platform's default behaviour of the seek keys (tuner or media seek), for a module that has
// no use of its own for a key press.
class HardKeyController : public QObject
{
    Q_OBJECT
public:
    static HardKeyController *instance();

    void processCombinedSeekLeftKey();
    void processCombinedSeekRightKey();
    void processSWCSeekDownShortPress();
    void processSWCSeekUpShortPress();
    void processSWCSeekDownLongPress();
    void processSWCSeekDownLongRelease();
    void processSWCSeekUpLongPress();
    void processSWCSeekUpLongRelease();

signals:
    // The fall-back that was asked for, by the name of its operation.
    void fallBackRequested(const QString &call);

private:
    explicit HardKeyController(QObject *parent = nullptr);
    void fallBack(const QString &call);
};

} // namespace Taldris
