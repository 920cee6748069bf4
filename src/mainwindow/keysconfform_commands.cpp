#include "keysconfform.h"

#include <QTreeWidgetItem>

void KeysConfForm::newCommand()
{
}

void KeysConfForm::editCommand()
{
}

void KeysConfForm::itemDoubleClicked(QTreeWidgetItem*, int)
{
}

void KeysConfForm::cloneCommand()
{
}

void KeysConfForm::deleteCommand()
{
}
