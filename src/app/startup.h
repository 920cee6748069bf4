#pragma once

class QByteArray;
class QIcon;
class QString;

// The main window's icon: the desktop's hotkeys icon, or its keyboard settings icon when the
// icon theme lacks the first.
QIcon editorWindowIcon();

// Single-instance id: the X display, so that editors on different displays do not meet.
QString singleInstanceId();

// The X display the program would open and cannot, as named by -display or DISPLAY; a null
// array when it can be opened or the program runs on another platform than X11.
QByteArray displayToOpen(int argc, char** argv);
