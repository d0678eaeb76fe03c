#include "journal.h"

namespace Platform {

Journal::Journal(QObject *parent)
    : QObject(parent)
{
    qRegisterMetaType<Platform::JournalEntry>();
}

Journal *Journal::instance()
{
    // Lives as long as the process: every library and the host write to the same record.
    static Journal journal;
    return &journal;
}

void Journal::append(const QString &kind, const QVariantMap &fields)
{
    JournalEntry entry{++m_sequence, kind, fields};
    m_entries.append(entry);
    emit appended(entry);
}

QList<JournalEntry> Journal::entriesSince(qint64 sequence) const
{
    QList<JournalEntry> result;
    for (const JournalEntry &entry : m_entries) {
        if (entry.sequence > sequence)
            result.append(entry);
    }
    return result;
}

void Journal::clear()
{
    m_entries.clear();
}

} // namespace Platform
