#pragma once

#include <QByteArray>

#include <cstdio>

// Captures what the code under test prints on standard error, from construction to finish().
class StderrCapture
{
public:
    StderrCapture();
    ~StderrCapture();
    QByteArray finish();

private:
    int saved = -1;
    FILE* file = nullptr;
};
