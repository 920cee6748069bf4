#include "bindingfilter.h"

#include "keyforms.h"

BindingFilter::BindingFilter(const QString& text) : text(text.trimmed().toLower()), key(keyFromUserText(text))
{
}

QString BindingFilter::searchText(const QString& action, const QString& function, const QString& shownKey)
{
    // Lower-cased once, and joined by a line break, which no filter text holds, so that a match
    // never spans two fields.
    return (action + QLatin1Char('\n') + function + QLatin1Char('\n') + shownKey).toLower();
}

bool BindingFilter::matches(const QString& searchText, const QString& storedKey) const
{
    return text.isEmpty() || searchText.contains(text) ||
           (!key.isEmpty() && storedKey.compare(key, Qt::CaseInsensitive) == 0);
}
