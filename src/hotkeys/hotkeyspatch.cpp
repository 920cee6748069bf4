#include "hotkeyspatch.h"

#include "functioncatalogue.h"
#include "hotkeysentries.h"
#include "keyforms.h"

#include <algorithm>

namespace {

QByteArray lineEndOf(const QByteArray& line)
{
    if (line.endsWith("\r\n"))
        return "\r\n";
    if (line.endsWith('\n'))
        return "\n";
    if (line.endsWith('\r'))
        return "\r";
    return QByteArray();
}

} // namespace

HotkeysPatch::HotkeysPatch(const HotkeysEntries& file, const QVector<QByteArray>& order,
                           const QHash<QByteArray, WantedEntry>& wanted)
    : file(file), order(order), wanted(wanted)
{
}

int HotkeysPatch::rankOf(const QByteArray& value)
{
    const QString action = unquoted(QString::fromLocal8Bit(value));
    const int functions = catalogueFunctionNames().size();
    if (action == QLatin1String("Disable"))
        return functions + 1;
    if (action.startsWith(QLatin1String("ZEMWM_")))
        return catalogueFunctionNames().indexOf(action);
    return functions;
}

bool HotkeysPatch::apply(QByteArray* bytes, QString* reason)
{
    if (!plan(reason))
        return false;
    *bytes = render(placeNewLines());
    return true;
}

bool HotkeysPatch::plan(QString* reason)
{
    // A binding given a key the file does not hold keeps the line it was read from, when no
    // other binding wants that line's key: the line stays where it is, with its comment.
    QHash<int, QByteArray> claims;
    for (auto it = wanted.cbegin(); it != wanted.cend(); ++it) {
        if (it->fromLine >= 0 && !file.find(it.key()) && !claims.contains(it->fromLine))
            claims.insert(it->fromLine, it.key());
    }
    for (const KeyEntry& entry : file.entries()) {
        const auto it = wanted.constFind(entry.identity);
        if (it != wanted.cend() && unquoted(it->value) == unquoted(entry.value))
            continue; // the same meaning: every line of the key stays as written
        for (int line : entry.others)
            removed.insert(line);
        if (it == wanted.cend()) {
            if (entry.counting >= 0 && claims.contains(entry.counting))
                rekeyed.insert(entry.counting, &*wanted.constFind(claims.value(entry.counting)));
            else if (entry.counting >= 0)
                removed.insert(entry.counting);
        } else if (!it->valueProblem.isEmpty()) {
            *reason = it->valueProblem;
            return false;
        } else if (entry.counting >= 0) {
            rewritten.insert(entry.counting, it->value);
        } else {
            added.append(&*it);
        }
    }
    const QList<const WantedEntry*> moved = rekeyed.values();
    for (const QByteArray& identity : order) {
        const WantedEntry* entry = &*wanted.constFind(identity);
        if (!file.find(identity) && !moved.contains(entry))
            added.append(entry);
    }
    for (const WantedEntry* entry : added + moved.toVector()) {
        const QString problem = entry->keyProblem.isEmpty() ? entry->valueProblem : entry->keyProblem;
        if (!problem.isEmpty()) {
            *reason = problem;
            return false;
        }
    }
    return true;
}

QHash<int, QVector<const WantedEntry*>> HotkeysPatch::placeNewLines() const
{
    // The section's entry lines that stay, each with its rank, and the new lines among them.
    struct Place
    {
        int line; // -1 for a new line
        int rank;
        const WantedEntry* entry;
    };
    const HotkeysLines& lines = file.lines();
    const QVector<HotkeysLine>& all = lines.lines();
    QVector<Place> places;
    int header = -1;
    for (int i = 0; i < all.size(); ++i) {
        if (header < 0 && lines.isHotkeysSection(i))
            header = i;
        if (all.at(i).kind != HotkeysLine::Entry || !lines.isHotkeysSection(all.at(i).section) ||
            removed.contains(i))
            continue;
        const QByteArray value =
            rekeyed.contains(i) ? rekeyed.value(i)->value : rewritten.value(i, all.at(i).value);
        places.append({i, rankOf(value), nullptr});
    }
    // New lines keep entries in order where they are; where they are not, they go last.
    bool ordered = true;
    int highest = -1;
    for (const Place& place : qAsConst(places)) {
        ordered = ordered && (place.rank < 0 || place.rank >= highest);
        highest = std::max(highest, place.rank);
    }
    QVector<const WantedEntry*> newLines = added;
    std::stable_sort(newLines.begin(), newLines.end(),
                     [](const WantedEntry* a, const WantedEntry* b) { return a->rank < b->rank; });
    for (const WantedEntry* entry : qAsConst(newLines)) {
        int after = places.size() - 1;
        while (ordered && after >= 0 && (places.at(after).rank < 0 || places.at(after).rank > entry->rank))
            --after;
        places.insert(after + 1, {-1, entry->rank, entry});
    }
    const auto firstKept =
        std::find_if(places.cbegin(), places.cend(), [](const Place& p) { return p.line >= 0; });
    QHash<int, QVector<const WantedEntry*>> following;
    int anchor = firstKept == places.cend() ? header : all.at(firstKept->line).section;
    for (const Place& place : qAsConst(places)) {
        if (place.line >= 0)
            anchor = place.line;
        else
            following[anchor].append(place.entry);
    }
    return following;
}

QByteArray HotkeysPatch::render(const QHash<int, QVector<const WantedEntry*>>& following) const
{
    const HotkeysLines& lines = file.lines();
    const QVector<HotkeysLine>& all = lines.lines();
    QByteArray out = lines.span(0, all.isEmpty() ? lines.textStart() : lines.leadingStart(0));
    for (int i = 0; i < all.size(); ++i) {
        const HotkeysLine& line = all.at(i);
        out += lines.span(lines.leadingStart(i), line.start);
        QByteArray own = lines.span(line.start, line.end);
        if (removed.contains(i))
            own.clear();
        else if (rekeyed.contains(i))
            own = rekeyed.value(i)->key + '=' + rekeyed.value(i)->value + lineEndOf(own);
        else if (rewritten.contains(i))
            own = lines.span(line.start, line.valueStart) + rewritten.value(i) +
                  lines.span(line.valueEnd, line.end);
        const auto news = following.constFind(i);
        if (news != following.cend()) {
            // A new line takes the line end of the line before it; a last line without one
            // gets one first.
            QByteArray end = lineEndOf(own);
            if (end.isEmpty()) {
                end = "\n";
                own += end;
            }
            for (const WantedEntry* entry : *news)
                own += entry->key + '=' + entry->value + end;
        }
        out += own;
    }
    return out + lines.trailing();
}
