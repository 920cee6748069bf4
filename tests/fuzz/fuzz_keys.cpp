// Key forms. Any text a file may hold as a key converts without harm; a key combination the
// recorder can produce is written so that it reads back as the same file key; and a stored key
// read from a file is written the same way again once read back.
#include "hotkeysfile.h"
#include "keyforms.h"
#include "zemkeyserver.h"

#include <QKeySequence>
#include <QString>

#include <cstdlib>
#include <cstring>

namespace {

bool sameFileKey(const QString& a, const QString& b)
{
    return foldedKey(a.toUtf8()) == foldedKey(b.toUtf8());
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    if (size >= sizeof(int)) {
        int code = 0;
        std::memcpy(&code, data, sizeof(int));
        // Every key the key server names is written faithfully; the writer refuses the others
        // unless they too read back.
        const QKeySequence recorded(code);
        if (!recorded.isEmpty() && !ZemKeyServer::KeyQtToKeyStringX(recorded[0]).isEmpty() &&
            !readsBackAsWritten(recorded.toString(QKeySequence::PortableText)))
            std::abort();
    }

    // One key, one meaning: letter case never makes two keys, and a key typed as the file
    // writes it is the same key written the same way.
    const QByteArray raw(reinterpret_cast<const char*>(data), int(size));
    if (keyIdentity(raw) != keyIdentity(foldedKey(raw)))
        std::abort();
    const QByteArray typed = fileKeyFromTyped(QString::fromLatin1(raw));
    if (!typed.isEmpty() &&
        (!isWritableFileKey(typed) || fileKeyFromTyped(QString::fromLatin1(typed)) != typed))
        std::abort();

    const QString text = QString::fromUtf8(reinterpret_cast<const char*>(data), int(size));
    toFileKey(text);
    const QString stored = fromFileKey(text);
    const QString written = fileKeyOf(stored);
    // Keys the writer refuses never reach a file. A stored key holding "None" may have been
    // pieced together by the removal of placeholders, which reading does in one pass; such a
    // key comes only from junk and is written back as it was read.
    if (!isWritableFileKey(written.toUtf8()) || stored.contains(QLatin1String("None")))
        return 0;
    if (!sameFileKey(fileKeyOf(fromFileKey(written)), written))
        std::abort();
    return 0;
}
