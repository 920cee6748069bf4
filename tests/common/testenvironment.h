#pragma once

#include "testfiles.h"

#include <QApplication>
#include <QString>
#include <QTemporaryDir>

// Points every directory the editor reads or writes (settings, the user's and the system's
// hotkeys directories) at fresh temporary folders, so no test touches the real home. Made
// before the application object, because settings paths are fixed on first use.
class TestEnvironment
{
public:
    TestEnvironment();

private:
    QTemporaryDir dir;
};

#define ZEM_TEST_MAIN(TestObject)                                                                            \
    int main(int argc, char** argv)                                                                          \
    {                                                                                                        \
        TestEnvironment environment;                                                                         \
        QApplication app(argc, argv);                                                                        \
        app.setAttribute(Qt::AA_Use96Dpi, true);                                                             \
        TestObject tc;                                                                                       \
        QTEST_SET_MAIN_SOURCE_PATH                                                                           \
        return QTest::qExec(&tc, argc, argv);                                                                \
    }
