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

// The reader's way through the bytes, step by step, with the lines it meets.
class Scanner
{
public:
    Scanner(const QByteArray& data, int from, QVector<HotkeysLine>* found);
    void run();

private:
    // Steps over one line end, "\r\n" counting as one.
    int newLineLength(int at) const;
    int withLineEnd(int at) const { return at < size ? at + newLineLength(at) : at; }
    // Skips blanks and line ends from `at`; `lineStart` follows the line ends passed.
    int skipSpaces(int at, int* lineStart, bool crossLines);
    int endOfLine(int at) const;
    int trimmedEnd(int from, int to) const;
    // A section header at q; where the scan goes on.
    int section(int q, int lineStart);
    // An entry, or a line the reader skips, at q; where the scan goes on.
    int entry(int q, int lineStart);

    const QByteArray& data;
    const char* d;
    const int size; // the reader stops at the first NUL byte
    QVector<HotkeysLine>* found;
    int p;
    int line = 1;
    int current = -1; // the section the lines now met belong to
};

Scanner::Scanner(const QByteArray& data, int from, QVector<HotkeysLine>* found)
    : data(data), d(data.constData()), size(data.contains('\0') ? data.indexOf('\0') : data.size()),
      found(found), p(from)
{
}

void Scanner::run()
{
    while (p < size) {
        int lineStart = p;
        const int q = skipSpaces(p, &lineStart, true);
        if (q >= size)
            break;
        if (d[q] == ';' || d[q] == '#')
            p = endOfLine(q);
        else if (d[q] == '[')
            p = section(q, lineStart);
        else
            p = entry(q, lineStart);
    }
}

int Scanner::newLineLength(int at) const
{
    return d[at] == '\r' && at + 1 < size && d[at + 1] == '\n' ? 2 : 1;
}

int Scanner::skipSpaces(int at, int* lineStart, bool crossLines)
{
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
}

int Scanner::endOfLine(int at) const
{
    while (at < size && !isNewLine(d[at]))
        ++at;
    return at;
}

int Scanner::trimmedEnd(int from, int to) const
{
    while (to > from && isSpace(d[to - 1]))
        --to;
    return to;
}

int Scanner::section(int q, int lineStart)
{
    HotkeysLine header;
    header.kind = HotkeysLine::Section;
    header.number = line;
    header.start = lineStart;
    const int nameStart = skipSpaces(q + 1, nullptr, true);
    const int r = endOfLine(nameStart);
    int close = nameStart;
    while (close < r && d[close] != ']')
        ++close;
    current = found->size();
    if (close >= r) {
        // The reader takes the unclosed name as the section of the lines that follow, a
        // section no file names: they are out of [ShortCutKeys].
        header.valid = false;
        header.end = withLineEnd(r);
        found->append(header);
        return r;
    }
    header.name = data.mid(nameStart, trimmedEnd(nameStart, close) - nameStart);
    const int eol = endOfLine(close);
    header.end = withLineEnd(eol);
    found->append(header);
    // The line end is left for the next skip, as the reader does; it counts the line.
    return eol;
}

int Scanner::entry(int q, int lineStart)
{
    int r = q;
    while (r < size && d[r] != '=' && !isNewLine(d[r]))
        ++r;
    if (r >= size || d[r] != '=' || r == q) {
        // No "=": not an entry. An empty key: the rest of the line is skipped.
        return endOfLine(r);
    }
    HotkeysLine entry;
    entry.kind = HotkeysLine::Entry;
    entry.number = line;
    entry.start = lineStart;
    entry.section = current;
    entry.key = data.mid(q, trimmedEnd(q, r) - q);
    const int valueStart = skipSpaces(r + 1, nullptr, false);
    const int eol = endOfLine(valueStart);
    entry.valueStart = valueStart;
    entry.valueEnd = trimmedEnd(valueStart, eol);
    entry.value = data.mid(valueStart, entry.valueEnd - valueStart);
    entry.end = withLineEnd(eol);
    if (eol < size)
        ++line;
    found->append(entry);
    return entry.end;
}

} // namespace

HotkeysLines::HotkeysLines(const QByteArray& bytes) : data(bytes)
{
    if (data.startsWith("\xEF\xBB\xBF"))
        bomLength = 3;
    Scanner(data, bomLength, &found).run();
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
