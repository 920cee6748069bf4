#pragma once

class QByteArray;
class QString;

#include <QtGlobal>

// Converts key combinations between Qt's key codes and the X key-string form that the hotkeys
// file is built from: modifier names and an X key-symbol name joined by "+" (for example
// "Ctrl+Alt+t", "Super+F5", "XF86AudioMute"). Needs no X display.
class ZemKeyServer
{
public:
    // One Qt key code with its modifier bits; empty when the key has no X name.
    static QString KeyQtToKeyStringX(int keyQt);
    // The same combination as QKeySequence portable text; empty when it cannot be read.
    static QString KeyStringXToQt(const QString& keyString);

    // The keysym an X key name names, read ignoring letter case as the hotkeys file compares
    // keys ("odiaeresis" and "Odiaeresis" give one keysym, "Prior" and "Page_Up" too); 0 for
    // no keysym.
    static quint32 keysymOfNameNoCase(const QByteArray& name);
    // The keysym an X key name names exactly, falling back to the name read ignoring case; 0
    // for no keysym.
    static quint32 keysymOfName(const QByteArray& name);
    // X's own name of a keysym; empty for a keysym without one.
    static QByteArray nameOfKeysym(quint32 keysym);
    // The keysym a Qt key code (modifiers ignored, the keypad bit heeded) stands for; 0 for none.
    static quint32 keysymOfKeyQt(int keyQt);
    // The keysym typing the character gives; 0 for none.
    static quint32 keysymOfCharacter(uint ucs4);
};
