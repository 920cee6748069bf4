#pragma once

class QString;

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
};
