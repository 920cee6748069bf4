#pragma once

#include "singleinstanceapplication.h"

// The editor's application object.
class MyApplication : public SingleInstanceApplication
{
    Q_OBJECT
    Q_DISABLE_COPY(MyApplication)

public:
    MyApplication(const QString& id, int& argc, char** argv);
};
