#include "stderrcapture.h"

#include <unistd.h>

StderrCapture::StderrCapture()
{
    std::fflush(stderr);
    saved = dup(fileno(stderr));
    file = std::tmpfile();
    if (file)
        dup2(fileno(file), fileno(stderr));
}

StderrCapture::~StderrCapture()
{
    finish();
}

QByteArray StderrCapture::finish()
{
    QByteArray text;
    if (saved < 0)
        return text;
    std::fflush(stderr);
    dup2(saved, fileno(stderr));
    close(saved);
    saved = -1;
    if (!file)
        return text;
    std::rewind(file);
    char buffer[512];
    size_t n = 0;
    while ((n = std::fread(buffer, 1, sizeof buffer, file)) > 0)
        text.append(buffer, int(n));
    std::fclose(file);
    file = nullptr;
    return text;
}
