#include "hotkeyslines.h"

#include "keyforms.h"

namespace {

bool isSpace(char c)
{
    return c == ' ' || c == '\t' || c == '\r' || c == '\n';
}

bool isNewLine(char c)
{
    return c == '\r' || c == '\n';
}

} // namespace

HotkeysLines::HotkeysLines(const QByteArray& bytes) : data(bytes)
{
    if (data.startsWith("\xEF\xBB\xBF"))
        bomLength = 3;
    // The reader stops at the first NUL byte.
    const int size = data.contains('\0') ? data.indexOf('\0') : data.size();
    const char* d = data.constData();

    int p = bomLength;
    int line = 1;
    int section = -1;
    // Steps over one line end, "\r\n" counting as one.
    const auto newLineLength = [&](int at) {
        return d[at] == '\r' && at + 1 < size && d[at + 1] == '\n' ? 2 : 1;
    };
    // Skips blanks and line ends from `at`; `lineStart` follows the line ends passed.
    const auto skipSpaces = [&](int at, int* lineStart, bool crossLines) {
        while (at < size && isSpace(d[at]) && (crossLines || !isNewLine(d[at]))) {
            if (isNewLine(d[at])) {
                at += newLineLength(at);
                ++line;
                if (lineStart)
                    *lineStart = at;
            } else {
                ++at;
            }
        }
        return at;
    };
    const auto endOfLine = [&](int at) {
        while (at < size && !isNewLine(d[at]))
            ++at;
        return at;
    };
    const auto withLineEnd = [&](int at) { return at < size ? at + newLineLength(at) : at; };
    const auto trimmedEnd = [&](int from, int to) {
        while (to > from && isSpace(d[to - 1]))
            --to;
        return to;
    };

    while (p < size) {
        int lineStart = p;
        const int startLine = line;
        Q_UNUSED(startLine)
        int q = skipSpaces(p, &lineStart, true);
        if (q >= size)
            break;
        const int number = line;

        if (d[q] == ';' || d[q] == '#') {
            p = endOfLine(q);
            continue;
        }

        if (d[q] == '[') {
            int r = skipSpaces(q + 1, nullptr, true);
            const int nameStart = r;
            r = endOfLine(r);
            int close = nameStart;
            while (close < r && d[close] != ']')
                ++close;
            HotkeysLine header;
            header.kind = HotkeysLine::Section;
            header.number = number;
            header.start = lineStart;
            if (close >= r) {
                // The reader takes the unclosed name as the section of the lines that follow,
                // a section no file names: they are out of [ShortCutKeys].
                header.valid = false;
                header.end = withLineEnd(r);
                section = found.size();
                found.append(header);
                p = r;
                continue;
            }
            header.name = data.mid(nameStart, trimmedEnd(nameStart, close) - nameStart);
            const int eol = endOfLine(close);
            header.end = withLineEnd(eol);
            section = found.size();
            found.append(header);
            // The line end is left for the next skip, as the reader does; it counts the line.
            p = eol;
            continue;
        }

        int r = q;
        while (r < size && d[r] != '=' && !isNewLine(d[r]))
            ++r;
        if (r >= size || d[r] != '=' || r == q) {
            // No "=": not an entry. An empty key: the rest of the line is skipped.
            p = endOfLine(r);
            continue;
        }
        HotkeysLine entry;
        entry.kind = HotkeysLine::Entry;
        entry.number = number;
        entry.start = lineStart;
        entry.section = section;
        entry.key = data.mid(q, trimmedEnd(q, r) - q);
        const int valueStart = skipSpaces(r + 1, nullptr, false);
        const int eol = endOfLine(valueStart);
        entry.valueStart = valueStart;
        entry.valueEnd = trimmedEnd(valueStart, eol);
        entry.value = data.mid(valueStart, entry.valueEnd - valueStart);
        entry.end = withLineEnd(eol);
        if (eol < size)
            ++line;
        found.append(entry);
        p = entry.end;
    }
}

int HotkeysLines::leadingStart(int i) const
{
    return i > 0 ? found.at(i - 1).end : bomLength;
}

QByteArray HotkeysLines::trailing() const
{
    const int from = found.isEmpty() ? bomLength : found.last().end;
    return data.mid(from);
}

bool HotkeysLines::isHotkeysSection(int i) const
{
    return i >= 0 && found.at(i).kind == HotkeysLine::Section && found.at(i).valid &&
           foldedKey(found.at(i).name) == "shortcutkeys";
}
