#include "zemkeyserver.h"

#include <KKeyServer>
#include <QKeySequence>
#include <QString>
#include <QStringList>

#include <algorithm>
#include <iterator>

#include <X11/XF86keysym.h>
#include <X11/Xlib.h>
#include <X11/keysym.h>
#include <xkbcommon/xkbcommon.h>

namespace {

struct ModifierName
{
    Qt::KeyboardModifier modifier;
    const char* name;
};

// The order in which modifiers are written.
constexpr ModifierName writtenModifiers[] = {
    {Qt::ControlModifier, "Ctrl"},
    {Qt::AltModifier, "Alt"},
    {Qt::ShiftModifier, "Shift"},
    {Qt::MetaModifier, "Super"},
};

Qt::KeyboardModifiers modifierFromName(const QString& name)
{
    const QString lower = name.toLower();
    if (lower == QLatin1String("ctrl") || lower == QLatin1String("control"))
        return Qt::ControlModifier;
    if (lower == QLatin1String("alt") || lower == QLatin1String("mod1"))
        return Qt::AltModifier;
    if (lower == QLatin1String("shift"))
        return Qt::ShiftModifier;
    if (lower == QLatin1String("super") || lower == QLatin1String("mod4") || lower == QLatin1String("win") ||
        lower == QLatin1String("meta"))
        return Qt::MetaModifier;
    return Qt::NoModifier;
}

KeySym keysymFromName(const QString& name)
{
    if (name.isEmpty())
        return NoSymbol;
    KeySym sym = XStringToKeysym(name.toLatin1().constData());
    if (sym == NoSymbol && name.size() > 1) {
        // Hand-edited files write "f5" or "print"; X names start with a capital letter.
        const QString capitalised = name.left(1).toUpper() + name.mid(1);
        sym = XStringToKeysym(capitalised.toLatin1().constData());
    }
    return sym;
}

// Keypad keys the KF5 key server folds into their main-keyboard twins, which the window manager
// tells apart: its table knows no keypad "=".
struct KeypadKey
{
    int keyQt;
    KeySym sym;
};
constexpr KeypadKey keypadOnly[] = {
    {Qt::Key_Equal, XK_KP_Equal},
};

} // namespace

QString ZemKeyServer::KeyQtToKeyStringX(int keyQt)
{
    const int key = keyQt & ~int(Qt::KeyboardModifierMask);
    if (key == 0 || key == Qt::Key_unknown)
        return QString();

    const char* keyName = nullptr;
    if (key == Qt::Key_Calculator) {
        keyName = "XF86Calculator";
    } else if (const quint32 keypad = (keyQt & Qt::KeypadModifier) ? keysymOfKeyQt(keyQt) : 0) {
        keyName = XKeysymToString(KeySym(keypad));
    } else {
        int sym = 0;
        if (!KKeyServer::keyQtToSymX(keyQt, &sym) || sym == 0)
            return QString();
        keyName = XKeysymToString(KeySym(sym));
    }
    if (!keyName)
        return QString();

    QStringList parts;
    for (const ModifierName& m : writtenModifiers) {
        if (keyQt & m.modifier)
            parts << QLatin1String(m.name);
    }
    parts << QLatin1String(keyName);
    return parts.join(QLatin1Char('+'));
}

QString ZemKeyServer::KeyStringXToQt(const QString& keyString)
{
    const QStringList parts = keyString.split(QLatin1Char('+'));
    int modifiers = 0;
    for (int i = 0; i < parts.size() - 1; ++i) {
        const Qt::KeyboardModifiers modifier = modifierFromName(parts.at(i).trimmed());
        if (modifier == Qt::NoModifier)
            return QString();
        modifiers |= int(modifier);
    }

    const KeySym sym = keysymFromName(parts.last().trimmed());
    if (sym == NoSymbol)
        return QString();
    int keyQt = 0;
    const auto keypad = std::find_if(std::begin(keypadOnly), std::end(keypadOnly),
                                     [&](const KeypadKey& k) { return k.sym == sym; });
    if (keypad != std::end(keypadOnly))
        keyQt = keypad->keyQt | Qt::KeypadModifier;
    else if (!KKeyServer::symXModXToKeyQt(uint32_t(sym), 0, &keyQt))
        return QString();
    const int key = keyQt & ~int(Qt::KeyboardModifierMask);
    if (key == 0 || key == Qt::Key_unknown)
        return QString();
    return QKeySequence(keyQt | modifiers).toString(QKeySequence::PortableText);
}

quint32 ZemKeyServer::keysymOfNameNoCase(const QByteArray& name)
{
    if (name.isEmpty())
        return 0;
    return xkb_keysym_from_name(name.constData(), XKB_KEYSYM_CASE_INSENSITIVE);
}

quint32 ZemKeyServer::keysymOfName(const QByteArray& name)
{
    if (name.isEmpty())
        return 0;
    const xkb_keysym_t exact = xkb_keysym_from_name(name.constData(), XKB_KEYSYM_NO_FLAGS);
    return exact != XKB_KEY_NoSymbol ? exact : keysymOfNameNoCase(name);
}

QByteArray ZemKeyServer::nameOfKeysym(quint32 keysym)
{
    // Xlib's names are the ones the window manager reads back.
    const char* name = keysym ? XKeysymToString(KeySym(keysym)) : nullptr;
    return name ? QByteArray(name) : QByteArray();
}

quint32 ZemKeyServer::keysymOfKeyQt(int keyQt)
{
    const int key = keyQt & ~int(Qt::KeyboardModifierMask);
    if (keyQt & Qt::KeypadModifier) {
        for (const KeypadKey& k : keypadOnly) {
            if (k.keyQt == key)
                return quint32(k.sym);
        }
    }
    if (key == Qt::Key_Calculator)
        return XF86XK_Calculator;
    int sym = 0;
    if (!KKeyServer::keyQtToSymX(key | (keyQt & Qt::KeypadModifier), &sym))
        return 0;
    return quint32(sym);
}

quint32 ZemKeyServer::keysymOfCharacter(uint ucs4)
{
    return xkb_utf32_to_keysym(ucs4);
}
