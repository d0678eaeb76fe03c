#pragma once

#include <QString>

#include <functional>

namespace Bench {

// Measures a piece of work: in instructions when the program runs under callgrind (each piece
// is dumped on its own and its count read back from the dump), in nanoseconds otherwise.
class Meter
{
public:
    Meter();

    bool instructions() const { return m_instructions; }
    // "Ir" or "ns".
    QString unit() const;

    // Runs `work` `repetitions` times and returns the cost of one repetition.
    double measure(const QString &label, int repetitions, const std::function<void()> &work);

private:
    double readDump(const QString &label) const;

    bool m_instructions = false;
};

} // namespace Bench
