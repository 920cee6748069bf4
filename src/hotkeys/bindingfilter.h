#pragma once

#include <QString>

// Which binding rows a filter text shows: those whose action, function name, command or shown
// key holds the text, ignoring case, and those whose key is the combination the text reads as.
class BindingFilter
{
public:
    explicit BindingFilter(const QString& text = QString());

    bool isEmpty() const { return text.isEmpty(); }
    // What of a row the text is looked for in, made once per row: its action (the command line
    // of a command row), its function name (empty for a command row) and its key as shown.
    static QString searchText(const QString& action, const QString& function, const QString& shownKey);
    // `key` is the row's stored key (portable text).
    bool matches(const QString& searchText, const QString& key) const;

private:
    QString text;
    QString key;
    bool wholeKey = false; // the text names a key that is only ever matched whole
};
