#pragma once

#include <QByteArray>
#include <QString>

// Writes a file with exactly these bytes (creating its directory); false when it cannot.
bool writeFile(const QString& path, const QByteArray& bytes);
// A file's bytes; empty when it cannot be read.
QByteArray readFile(const QString& path);
