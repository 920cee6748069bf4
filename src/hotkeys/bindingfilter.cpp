#include "bindingfilter.h"

#include "keyforms.h"

#include <QKeySequence>

BindingFilter::BindingFilter(const QString& text) : text(text.trimmed().toLower()), key(keyFromUserText(text))
{
    // A text that names a combination with a modifier, or a key that types no character (F1,
    // Print), is looked for as that key, not as part of another: "ctrl+alt+l" is not
    // Ctrl+Alt+Left.
    const QKeySequence sequence = QKeySequence::fromString(key, QKeySequence::PortableText);
    const int combined = sequence.isEmpty() ? 0 : sequence[0];
    const int bare = combined & ~int(Qt::KeyboardModifierMask);
    wholeKey =
        !key.isEmpty() &&
        ((combined & int(Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier | Qt::ShiftModifier)) ||
         bare >= Qt::Key_Escape);
}

QString BindingFilter::searchText(const QString& action, const QString& function, const QString& shownKey)
{
    // Lower-cased once, and joined by a line break, which no filter text holds, so that a match
    // never spans two fields.
    return (action + QLatin1Char('\n') + function + QLatin1Char('\n') + shownKey).toLower();
}

bool BindingFilter::matches(const QString& searchText, const QString& storedKey) const
{
    if (text.isEmpty() || (!key.isEmpty() && storedKey.compare(key, Qt::CaseInsensitive) == 0))
        return true;
    // The shown key is the last of the fields; a whole key is not looked for inside it.
    return (wholeKey ? QStringRef(&searchText, 0, searchText.lastIndexOf(QLatin1Char('\n')))
                     : QStringRef(&searchText))
        .contains(text);
}
