#pragma once

class QIcon;
class QString;

// The main window's icon: the desktop's hotkeys icon, or its keyboard settings icon when the
// icon theme lacks the first.
QIcon editorWindowIcon();

// Single-instance id: the X display, so that editors on different displays do not meet.
QString singleInstanceId();
