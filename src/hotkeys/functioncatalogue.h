#pragma once

#include <QString>
#include <QStringList>
#include <QVector>

// One line of the window manager's function catalogue: a group title (no key name, code 0) or
// a function with the name the hotkeys file knows it by.
struct WmFunctionEntry
{
    const char* keyName = nullptr; // null for a group entry
    QString text;                  // translated description or group title
    qint32 code = 0;               // 0 for a group entry, else unique and positive
};

// The catalogue in its fixed order, each group entry followed by its functions, with the texts
// translated for the current language.
QVector<WmFunctionEntry> buildWmFunctionTable(bool translated = true);

// The names of the catalogue's functions, in its order (a function's index in the catalogue).
const QStringList& catalogueFunctionNames();
// A function's index in the catalogue; -1 for a name it does not hold.
int catalogueFunctionIndex(const QString& name);
