#include "myapplication.h"

MyApplication::MyApplication(const QString& id, int& argc, char** argv)
    : SingleInstanceApplication(id, argc, argv)
{
}
