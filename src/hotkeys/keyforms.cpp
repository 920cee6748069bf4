#include "keyforms.h"

#include "zemkeyserver.h"

#include <QHash>
#include <QKeySequence>
#include <QRegularExpression>
#include <QStringList>
#include <QVector>

namespace {

enum ModifierBit { CtrlBit = 1, AltBit = 2, ShiftBit = 4, SuperBit = 8 };

// The modifier a word names, read as the key server reads it; 0 for none.
int modifierBit(const QByteArray& folded)
{
    if (folded == "ctrl" || folded == "control")
        return CtrlBit;
    if (folded == "alt" || folded == "mod1")
        return AltBit;
    if (folded == "shift")
        return ShiftBit;
    if (folded == "super" || folded == "mod4" || folded == "win" || folded == "meta")
        return SuperBit;
    return 0;
}

// Qt's modifier bits for the same, in the order the file writes them.
struct WrittenModifier
{
    int bit;
    Qt::KeyboardModifier qt;
    const char* name;
};
constexpr WrittenModifier writtenModifiers[] = {
    {CtrlBit, Qt::ControlModifier, "Ctrl"},
    {AltBit, Qt::AltModifier, "Alt"},
    {ShiftBit, Qt::ShiftModifier, "Shift"},
    {SuperBit, Qt::MetaModifier, "Super"},
};

bool isSeparator(QChar c)
{
    return c == QLatin1Char('+') || c == QLatin1Char('|');
}

// The keysym a typed key name names: one character as typing it gives, an X name (exact, then
// in any letter case), or a Qt name ("PgUp", "Esc", "Volume Mute").
quint32 keysymOfTyped(const QString& name, bool keypad)
{
    if (!keypad) {
        const QVector<uint> ucs4 = name.toUcs4();
        if (ucs4.size() == 1) {
            if (const quint32 sym = ZemKeyServer::keysymOfCharacter(ucs4.first()))
                return sym;
        }
        const QByteArray latin = name.toLatin1();
        if (QString::fromLatin1(latin) == name) {
            if (const quint32 sym = ZemKeyServer::keysymOfName(latin))
                return sym;
        }
    }
    const int keyQt = QKeySequence::fromString(name, QKeySequence::PortableText)[0];
    const int key = keyQt & ~int(Qt::KeyboardModifierMask);
    if (key == 0 || key == Qt::Key_unknown || (keyQt & Qt::KeyboardModifierMask))
        return 0;
    return ZemKeyServer::keysymOfKeyQt(key | (keypad ? int(Qt::KeypadModifier) : 0));
}

} // namespace

QString toFileKey(const QString& keyString)
{
    QString key = keyString;
    const int lastPlus = key.lastIndexOf(QLatin1Char('+'));
    if (lastPlus < 0) {
        if (key.size() == 1)
            key = key.toLower();
        return QLatin1String("None|") + key;
    }
    const QString keyPart = key.mid(lastPlus + 1);
    if (keyPart.size() == 1)
        key = key.left(lastPlus + 1) + keyPart.toLower();
    key.replace(QLatin1Char('+'), QLatin1Char('|'));
    return key;
}

QString fromFileKey(const QString& fileKey, bool* readable)
{
    static const QRegularExpression placeholder(QStringLiteral("None[0-9]+"));

    QString key = unquoted(fileKey);
    key.replace(QLatin1Char('|'), QLatin1Char('+'));
    key.remove(QStringLiteral("None+"));
    key.remove(placeholder);

    if (readable)
        *readable = true;
    if (key == QLatin1String("XF86Calculator"))
        return QStringLiteral("Calculator");
    const QString converted = ZemKeyServer::KeyStringXToQt(key);
    if (readable)
        *readable = key.isEmpty() || !converted.isEmpty();
    return converted.isEmpty() ? key : converted;
}

QString fileKeyOf(const QString& storedKey)
{
    const QKeySequence sequence = QKeySequence::fromString(storedKey, QKeySequence::NativeText);
    QString keyString = ZemKeyServer::KeyQtToKeyStringX(sequence.isEmpty() ? 0 : sequence[0]);
    if (keyString.isEmpty())
        keyString = storedKey;
    return toFileKey(keyString);
}

QByteArray fileKeyFromTyped(const QString& text)
{
    const QString simple = text.trimmed();
    if (simple.isEmpty())
        return QByteArray();
    // The key is the last part. A separator right after another, or alone, is the key itself:
    // "Ctrl+Alt+|" is the bar key, "Ctrl++" the plus key; "Ctrl+" names no key.
    int keyStart = simple.size() - 1;
    if (isSeparator(simple.back())) {
        if (simple.size() > 1 && !isSeparator(simple.at(simple.size() - 2)))
            return QByteArray();
    } else {
        while (keyStart > 0 && !isSeparator(simple.at(keyStart - 1)))
            --keyStart;
    }
    const QString keyName = simple.mid(keyStart).trimmed();
    QString modifierPart = simple.left(keyStart);
    if (!modifierPart.isEmpty())
        modifierPart.chop(1);
    if (keyName.isEmpty())
        return QByteArray();

    int modifiers = 0;
    bool keypad = false;
    if (!modifierPart.isEmpty()) {
        for (const QString& word : modifierPart.split(QRegularExpression(QStringLiteral("[+|]")))) {
            const QByteArray folded = word.trimmed().toLatin1().toLower();
            if (folded == "none")
                continue;
            if (folded == "num" || folded == "keypad") {
                keypad = true;
                continue;
            }
            const int bit = modifierBit(folded);
            if (!bit)
                return QByteArray();
            modifiers |= bit;
        }
    }
    const QByteArray name = ZemKeyServer::nameOfKeysym(keysymOfTyped(keyName, keypad));
    if (name.isEmpty())
        return QByteArray();
    QString keyString;
    for (const WrittenModifier& m : writtenModifiers) {
        if (modifiers & m.bit)
            keyString += QLatin1String(m.name) + QLatin1Char('+');
    }
    return toFileKey(keyString + QString::fromLatin1(name)).toLatin1();
}

QString keyFromUserText(const QString& text)
{
    const QByteArray fileKey = fileKeyFromTyped(text);
    if (fileKey.isEmpty())
        return QString();
    bool readable = false;
    const QString stored = fromFileKey(QString::fromLatin1(fileKey), &readable);
    return readable ? stored : QString();
}

namespace {

QByteArray keyIdentityOf(int modifiers, quint32 sym)
{
    return "k:" + QByteArray::number(modifiers) + ':' + QByteArray::number(sym, 16);
}

// Most keys hold no "none": their parts are read where they stand.
bool plainIdentity(const QByteArray& folded, QByteArray* identity)
{
    if (folded.contains("none"))
        return false;
    int modifiers = 0;
    int start = 0;
    for (int i = 0; i < folded.size(); ++i) {
        if (folded.at(i) != '|' && folded.at(i) != '+')
            continue;
        const int bit = modifierBit(QByteArray::fromRawData(folded.constData() + start, i - start));
        if (!bit) {
            *identity = "t:" + folded;
            return true;
        }
        modifiers |= bit;
        start = i + 1;
    }
    const quint32 sym = ZemKeyServer::keysymOfNameNoCase(folded.mid(start));
    *identity = sym ? keyIdentityOf(modifiers, sym) : "t:" + folded;
    return true;
}

QByteArray identityOf(const QByteArray& fileKey)
{
    // Everything below works on the key without letter case, so that keys the file takes for
    // one are one key here too.
    const QByteArray folded = foldedKey(unquoted(fileKey));
    QByteArray plain;
    if (plainIdentity(folded, &plain))
        return plain.isEmpty() || folded.isEmpty() ? "p:" + folded : plain;
    QList<QByteArray> parts = QByteArray(folded).replace('|', '+').split('+');
    // As reading does: "None" before a name and placeholders ("None" and digits) go.
    QList<QByteArray> kept;
    for (int i = 0; i < parts.size(); ++i) {
        QByteArray part = parts.at(i);
        if (part == "none" && i + 1 < parts.size())
            continue;
        for (int at = part.indexOf("none"); at >= 0; at = part.indexOf("none", at)) {
            int end = at + 4;
            while (end < part.size() && part.at(end) >= '0' && part.at(end) <= '9')
                ++end;
            if (end > at + 4)
                part.remove(at, end - at);
            else
                at = end;
        }
        kept << part;
    }
    if (kept.size() == 1 && kept.first().isEmpty())
        return "p:" + folded;

    int modifiers = 0;
    for (int i = 0; i < kept.size() - 1; ++i) {
        const int bit = modifierBit(kept.at(i));
        if (!bit)
            return "t:" + folded;
        modifiers |= bit;
    }
    const quint32 sym = ZemKeyServer::keysymOfNameNoCase(kept.last());
    if (!sym)
        return "t:" + folded;
    return keyIdentityOf(modifiers, sym);
}

} // namespace

QByteArray keyIdentity(const QByteArray& fileKey)
{
    // Loading and writing ask for the same keys again and again. Kept for the life of the
    // process, which ends without taking it apart.
    static auto* known = new QHash<QByteArray, QByteArray>;
    const auto it = known->constFind(fileKey);
    if (it != known->cend())
        return *it;
    if (known->size() > 100000)
        known->clear();
    const QByteArray identity = identityOf(fileKey);
    known->insert(fileKey, identity);
    return identity;
}

bool isKeyIdentity(const QByteArray& identity)
{
    return !identity.startsWith("p:");
}

QString unquoted(const QString& text)
{
    const QLatin1Char quote('"');
    if (text.size() >= 2 && text.startsWith(quote) && text.endsWith(quote))
        return text.mid(1, text.size() - 2);
    return text;
}

QByteArray unquoted(const QByteArray& text)
{
    if (text.size() >= 2 && text.startsWith('"') && text.endsWith('"'))
        return text.mid(1, text.size() - 2);
    return text;
}

bool isWritableFileKey(const QByteArray& key)
{
    const auto isBlank = [](char c) { return c == ' ' || c == '\t'; };
    return !key.isEmpty() && !key.contains('\n') && !key.contains('\r') && !key.contains('\0') &&
           !key.contains('=') && !isBlank(key.front()) && !isBlank(key.back()) &&
           !QByteArray(";#[\"").contains(key.front());
}

bool readsBackAsWritten(const QString& storedKey)
{
    const QByteArray written = fileKeyOf(storedKey).toLocal8Bit();
    return isWritableFileKey(written) &&
           keyIdentity(fileKeyOf(fromFileKey(QString::fromLocal8Bit(written))).toLocal8Bit()) ==
               keyIdentity(written);
}

QByteArray foldedKey(const QByteArray& key)
{
    QByteArray folded = key;
    for (char& c : folded) {
        if (c >= 'A' && c <= 'Z')
            c = char(c - 'A' + 'a');
    }
    return folded;
}
