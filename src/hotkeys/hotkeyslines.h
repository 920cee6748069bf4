#pragma once

#include <QByteArray>
#include <QVector>

// A section header or an entry of a hotkeys file, where it stands in the bytes.
struct HotkeysLine
{
    enum Kind { Section, Entry };

    Kind kind = Entry;
    int number = 0; // line number of its first line, counted from 1
    int start = 0;  // its bytes: whole lines, line ends included
    int end = 0;
    int section = -1;  // entries: index of their section header among the lines; -1 before any
    bool valid = true; // sections: false for a "[" never closed on its line
    QByteArray name;   // sections: the name, trimmed
    QByteArray key;    // entries: key and value, trimmed as the reader trims them
    QByteArray value;
    int valueStart = 0; // entries: where the trimmed value stands in the bytes
    int valueEnd = 0;
};

// The bytes of a hotkeys file as lines, so that what the editor leaves alone can be written
// back byte for byte and findings can name a line. It scans exactly as the INI reader of
// HotkeysDocument does (blanks, "\r", "\n" and "\r\n" line ends, comments, a section name
// continued on a later line, lines without "=", the end at a NUL byte), so the two always
// agree on which entries there are. Everything between two lines (blank lines, comments,
// lines the reader skips) belongs to the line below it.
class HotkeysLines
{
public:
    explicit HotkeysLines(const QByteArray& bytes);

    const QByteArray& bytes() const { return data; }
    const QVector<HotkeysLine>& lines() const { return found; }
    // Where the text proper begins: after a UTF-8 byte-order mark, if any.
    int textStart() const { return bomLength; }
    // Where the bytes that belong to line i begin: the end of the line before it.
    int leadingStart(int i) const;
    // Bytes after the last line.
    QByteArray trailing() const;
    QByteArray span(int from, int to) const { return data.mid(from, to - from); }
    bool isHotkeysSection(int i) const;

private:
    QByteArray data;
    QVector<HotkeysLine> found;
    int bomLength = 0;
};
