#include "bindingfilter.h"

#include "hotkeysfile.h"

#include <QKeySequence>
#include <QStringList>

namespace {

// The modifier a word names, in QKeySequence's portable spelling; empty for none.
QString modifierName(const QString& word)
{
    const QString lower = word.toLower();
    if (lower == QLatin1String("ctrl") || lower == QLatin1String("control"))
        return QStringLiteral("Ctrl");
    if (lower == QLatin1String("alt") || lower == QLatin1String("mod1"))
        return QStringLiteral("Alt");
    if (lower == QLatin1String("shift"))
        return QStringLiteral("Shift");
    if (lower == QLatin1String("meta") || lower == QLatin1String("super") || lower == QLatin1String("win") ||
        lower == QLatin1String("mod4"))
        return QStringLiteral("Meta");
    return QString();
}

} // namespace

QString keyFromUserText(const QString& text)
{
    QString simple = text.trimmed();
    simple.replace(QLatin1Char('|'), QLatin1Char('+'));
    // "Ctrl++" names the plus key; keep it whole while splitting.
    const bool plusKey = simple.endsWith(QLatin1String("++")) || simple == QLatin1String("+");
    QStringList parts = simple.split(QLatin1Char('+'), Qt::SkipEmptyParts);
    if (plusKey)
        parts << QStringLiteral("+");
    if (parts.isEmpty())
        return QString();
    const QString keyName = parts.takeLast();
    QStringList modifiers;
    for (const QString& part : qAsConst(parts)) {
        if (part.compare(QLatin1String("None"), Qt::CaseInsensitive) == 0)
            continue;
        const QString modifier = modifierName(part);
        if (modifier.isEmpty())
            return QString();
        if (!modifiers.contains(modifier))
            modifiers << modifier;
    }
    // The key itself in Qt's words, else in X's.
    int key = QKeySequence::fromString(keyName, QKeySequence::PortableText)[0];
    if (key == 0 || (key & ~int(Qt::KeyboardModifierMask)) == Qt::Key_unknown) {
        const QString fromX = fromFileKey(QLatin1String("None|") + keyName);
        key = fromX.contains(QLatin1Char('+'))
                  ? 0
                  : QKeySequence::fromString(fromX, QKeySequence::PortableText)[0];
    }
    if (key == 0 || (key & ~int(Qt::KeyboardModifierMask)) == Qt::Key_unknown ||
        (key & int(Qt::KeyboardModifierMask)))
        return QString();
    int combined = key;
    for (const QString& modifier : qAsConst(modifiers))
        combined |= QKeySequence::fromString(modifier + QLatin1String("+A"), QKeySequence::PortableText)[0] &
                    int(Qt::KeyboardModifierMask);
    return QKeySequence(combined).toString(QKeySequence::PortableText);
}

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
