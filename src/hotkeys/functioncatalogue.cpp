#include "functioncatalogue.h"

#include <QHash>

#include <QCoreApplication>

#include <iterator>

namespace {

struct RawEntry
{
    const char* keyName;
    const char* text;
    qint32 code;
};

// The window manager's functions as it names them. The descriptions stay letter for letter as
// they have always read, slips included, so that existing translations keep matching.
constexpr RawEntry catalogue[] = {
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Window decoration (on/off)"), 0},
    {"ZEMWM_TOGGLE_BORDER", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a border"), 48},
    {"ZEMWM_TOGGLE_BORDER_EDGE", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a border edge"), 49},
    {"ZEMWM_TOGGLE_BUTTON1", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a minimize button"), 50},
    {"ZEMWM_TOGGLE_BUTTON2", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a restore button"), 51},
    {"ZEMWM_TOGGLE_BUTTON3", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a close button"), 52},
    {"ZEMWM_TOGGLE_CTRLBTN", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a control button"), 53},
    {"ZEMWM_TOGGLE_TBUTTON", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a taskbar button"), 54},
    {"ZEMWM_TOGGLE_TITLE", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a title bar"), 55},
    {"ZEMWM_TOGGLE_DECOR", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of all decorations"), 56},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Taskbar"), 0},
    {"ZEMWM_BOTTOM", QT_TRANSLATE_NOOP("KeysConfForm", "move the taskbar to bottom"), 99},
    {"ZEMWM_TOP", QT_TRANSLATE_NOOP("KeysConfForm", "move the taskbar to top"), 100},
    {"ZEMWM_LEFT", QT_TRANSLATE_NOOP("KeysConfForm", "move the taskbar to left"), 101},
    {"ZEMWM_RIGHT", QT_TRANSLATE_NOOP("KeysConfForm", "move the taskbar to right"), 102},
    {"ZEMWM_TOGGLE_AUTOHIDE", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of TaskbarAutoHide"), 108},
    {"ZEMWM_ENABLE_AUTOHIDE", QT_TRANSLATE_NOOP("KeysConfForm", "enable TaskbarAutoHide"), 109},
    {"ZEMWM_DISABLE_AUTOHIDE", QT_TRANSLATE_NOOP("KeysConfForm", "disable TaskbarAutoHide"), 110},
    {"ZEMWM_TOGGLE_TASKBAR", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of the taskbar show/hide"),
     103},
    {"ZEMWM_ENABLE_TASKBAR", QT_TRANSLATE_NOOP("KeysConfForm", "show the taskbar"), 104},
    {"ZEMWM_DISABLE_TASKBAR", QT_TRANSLATE_NOOP("KeysConfForm", "hide the taskbar"), 105},
    {"ZEMWM_SHOW_TASKBAR", QT_TRANSLATE_NOOP("KeysConfForm", "appear the taskbar when TaskbarAutoHide"), 106},
    {"ZEMWM_HIDE_TASKBAR", QT_TRANSLATE_NOOP("KeysConfForm", "disappear the taskbar when TaskbarAutoHide"),
     107},
    {"ZEMWM_TOGGLE_ONTOP_TASKBAR",
     QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of the taskbar top/botton"), 111},
    {"ZEMWM_ENABLE_ONTOP_TASKBAR", QT_TRANSLATE_NOOP("KeysConfForm", "taskbar on top of all"), 112},
    {"ZEMWM_DISABLE_ONTOP_TASKBAR", QT_TRANSLATE_NOOP("KeysConfForm", "taskbar on bottom of all"), 113},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Desktop Icon"), 0},
    {"ZEMWM_LINEUP_ICON", QT_TRANSLATE_NOOP("KeysConfForm", "line up icons"), 128},
    {"ZEMWM_ORDER_ICON", QT_TRANSLATE_NOOP("KeysConfForm", "order icons"), 129},
    {"ZEMWM_ICON_SELECT_ALL", QT_TRANSLATE_NOOP("KeysConfForm", "select all icons"), 130},
    {"ZEMWM_ICON_FIND", QT_TRANSLATE_NOOP("KeysConfForm", "find icons"), 131},
    {"ZEMWM_EXEC_ICON", QT_TRANSLATE_NOOP("KeysConfForm", "execute the icon"), 132},
    {"ZEMWM_ICON_OPEN_WITH", QT_TRANSLATE_NOOP("KeysConfForm", "execute the icon with"), 133},
    {"ZEMWM_ICON_SEND_TO_EMAIL", QT_TRANSLATE_NOOP("KeysConfForm", "send the icon by email"), 134},
    {"ZEMWM_ICON_DELETE", QT_TRANSLATE_NOOP("KeysConfForm", "delete the icon"), 135},
    {"ZEMWM_ICON_PROPERTIES", QT_TRANSLATE_NOOP("KeysConfForm", "show icon properties"), 136},
    {"ZEMWM_ICON_ITEM_CREATE", QT_TRANSLATE_NOOP("KeysConfForm", "create an icon"), 137},
    {"ZEMWM_ICON_TXT_CREATE", QT_TRANSLATE_NOOP("KeysConfForm", "create a text file"), 138},
    {"ZEMWM_ICON_SESSION_CREATE", QT_TRANSLATE_NOOP("KeysConfForm", "create a session script file"), 139},
    {"ZEMWM_ICON_FOLDER_CREATE", QT_TRANSLATE_NOOP("KeysConfForm", "cretae a folder"), 140},
    {"ZEMWM_ICON_SEND_TO_HOME", QT_TRANSLATE_NOOP("KeysConfForm", "send icon to home folder"), 141},
    {"ZEMWM_ICON_SEND_TO_MYDOC", QT_TRANSLATE_NOOP("KeysConfForm", "send icon to My documents folder"), 142},
    {"ZEMWM_ICON_SEND_TO_TRASH", QT_TRANSLATE_NOOP("KeysConfForm", "send icon trash can"), 143},
    {"ZEMWM_ICON_SEND_TO_STARTMENU", QT_TRANSLATE_NOOP("KeysConfForm", "send icon start menu"), 144},
    {"ZEMWM_ICON_SEND_TO_TOOLBAR", QT_TRANSLATE_NOOP("KeysConfForm", "send icon to toolbar"), 145},
    {"ZEMWM_ICON_SEND_TO_FOLDER", QT_TRANSLATE_NOOP("KeysConfForm", "send icon to folder"), 146},
    {"ZEMWM_ICON_CUT", QT_TRANSLATE_NOOP("KeysConfForm", "cut icon(s)"), 147},
    {"ZEMWM_ICON_COPY", QT_TRANSLATE_NOOP("KeysConfForm", "copy icon(s)"), 148},
    {"ZEMWM_ICON_PASTE", QT_TRANSLATE_NOOP("KeysConfForm", "paste icon(s)"), 149},
    {"ZEMWM_ICON_UP", QT_TRANSLATE_NOOP("KeysConfForm", "navigate up"), 150},
    {"ZEMWM_ICON_DOWN", QT_TRANSLATE_NOOP("KeysConfForm", "navigate down"), 151},
    {"ZEMWM_ICON_LEFT", QT_TRANSLATE_NOOP("KeysConfForm", "navigate left"), 152},
    {"ZEMWM_ICON_RIGHT", QT_TRANSLATE_NOOP("KeysConfForm", "navigate right"), 153},
    {"ZEMWM_ICON_RENAME", QT_TRANSLATE_NOOP("KeysConfForm", "rename icon"), 154},
    {"ZEMWM_ICON_UNDO", QT_TRANSLATE_NOOP("KeysConfForm", "undo last operation on desktop"), 155},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Keyboard"), 0},
    {"ZEMWM_BASE_KB", QT_TRANSLATE_NOOP("KeysConfForm", "switch to base keyboard"), 156},
    {"ZEMWM_ALT_KB", QT_TRANSLATE_NOOP("KeysConfForm", "switch to alt keyboard"), 157},
    {"ZEMWM_TOGGLE_KB", QT_TRANSLATE_NOOP("KeysConfForm", "switch keyboard"), 158},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Pager"), 0},
    {"ZEMWM_TOGGLE_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of the pager show/hide"), 114},
    {"ZEMWM_ENABLE_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "show the pager"), 115},
    {"ZEMWM_DISABLE_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "hide the pager"), 116},
    {"ZEMWM_TOGGLE_ONTOP_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of the pager top/botton"),
     117},
    {"ZEMWM_ENABLE_ONTOP_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "pager on top of all"), 118},
    {"ZEMWM_DISABLE_ONTOP_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "pager on botton of all"), 119},
    {"ZEMWM_ADD_ROW_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "add row to the pager"), 120},
    {"ZEMWM_SUB_ROW_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "remove row from the pager"), 121},
    {"ZEMWM_ADD_COL_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "add column to the pager"), 122},
    {"ZEMWM_SUB_COL_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "remove column from the pager"), 123},
    {"ZEMWM_UPDATE_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "update the pager"), 124},
    {"ZEMWM_MAXIMIZE_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "maximize the pager (fullscreen)"), 125},
    {"ZEMWM_RESTORE_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "restore the pager (small window)"), 126},
    {"ZEMWM_TOGGLE_FULLSCREEN_PAGER", QT_TRANSLATE_NOOP("KeysConfForm", "toggle pager fullscreen mode"), 127},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Paging"), 0},
    {"ZEMWM_LEFT_PAGING", QT_TRANSLATE_NOOP("KeysConfForm", "switch to the left page"), 94},
    {"ZEMWM_RIGHT_PAGING", QT_TRANSLATE_NOOP("KeysConfForm", "switch to the right page"), 95},
    {"ZEMWM_UP_PAGING", QT_TRANSLATE_NOOP("KeysConfForm", "switch to the up page"), 96},
    {"ZEMWM_DOWN_PAGING", QT_TRANSLATE_NOOP("KeysConfForm", "switch to the down page"), 97},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Search panel"), 0},
    {"ZEMWM_SEARCH_PANEL_TOGGLE", QT_TRANSLATE_NOOP("KeysConfForm", "toggle search panel"), 80},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Menu"), 0},
    {"ZEMWM_POPUP_START_MENU", QT_TRANSLATE_NOOP("KeysConfForm", "pop up the start menu"), 81},
    {"ZEMWM_POPUP_DESKTOP_MENU", QT_TRANSLATE_NOOP("KeysConfForm", "pop up the desktop menu"), 82},
    {"ZEMWM_POPUP_MENU", QT_TRANSLATE_NOOP("KeysConfForm", "pop up a window ctrl menu"), 83},
    {"ZEMWM_POPDOWN_MENU", QT_TRANSLATE_NOOP("KeysConfForm", "pop down a menu"), 84},
    {"ZEMWM_POPDOWN_ALL_MENU", QT_TRANSLATE_NOOP("KeysConfForm", "pop down all menus"), 85},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Rearrangement"), 0},
    {"ZEMWM_OVERLAP", QT_TRANSLATE_NOOP("KeysConfForm", "overlap all windows"), 64},
    {"ZEMWM_OVERLAP_INSCR", QT_TRANSLATE_NOOP("KeysConfForm", "overlap windows within the screen"), 65},
    {"ZEMWM_TILE_HORZ", QT_TRANSLATE_NOOP("KeysConfForm", "horizontally tile all windows"), 66},
    {"ZEMWM_TILE_HORZ_INSCR",
     QT_TRANSLATE_NOOP("KeysConfForm", "horizontally tile windows within the screen"), 67},
    {"ZEMWM_TILE_VERT", QT_TRANSLATE_NOOP("KeysConfForm", "vertically tile all windows"), 68},
    {"ZEMWM_TILE_VERT_INSCR", QT_TRANSLATE_NOOP("KeysConfForm", "vertically tile windows within the screen"),
     69},
    {"ZEMWM_TILE_MATRIX", QT_TRANSLATE_NOOP("KeysConfForm", "tile all windows in matrix"), 70},
    {"ZEMWM_TILE_MATRIX_INSCR", QT_TRANSLATE_NOOP("KeysConfForm", "tile windows in matrix within the screen"),
     71},
    {"ZEMWM_MINIMIZE_ALL", QT_TRANSLATE_NOOP("KeysConfForm", "minimize all windows"), 72},
    {"ZEMWM_MINIMIZE_ALL_INSCR", QT_TRANSLATE_NOOP("KeysConfForm", "minimize windows within the screen"), 73},
    {"ZEMWM_TOGGLE_MINIMIZE_ALL", QT_TRANSLATE_NOOP("KeysConfForm", "minimize/restore all windows"), 74},
    {"ZEMWM_TOGGLE_MINIMIZE_ALL_INSCR",
     QT_TRANSLATE_NOOP("KeysConfForm", "minimize/restore windows within the screen"), 75},
    {"ZEMWM_RESTORE_ALL", QT_TRANSLATE_NOOP("KeysConfForm", "restore all windows"), 76},
    {"ZEMWM_RESTORE_ALL_INSCR", QT_TRANSLATE_NOOP("KeysConfForm", "restore windows within the screen"), 77},
    {"ZEMWM_CLOSE_ALL", QT_TRANSLATE_NOOP("KeysConfForm", "close all windows"), 78},
    {"ZEMWM_CLOSE_ALL_INSCR", QT_TRANSLATE_NOOP("KeysConfForm", "close windows within the screen"), 79},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Window placement"), 0},
    {"ZEMWM_MOVE", QT_TRANSLATE_NOOP("KeysConfForm", "move a window"), 35},
    {"ZEMWM_MOVE_XINERAMA_NEXT", QT_TRANSLATE_NOOP("KeysConfForm", "move a window to the next screen"), 36},
    {"ZEMWM_MOVE_XINERAMA_PREV", QT_TRANSLATE_NOOP("KeysConfForm", "move a window to the previous screen"),
     37},
    {"ZEMWM_RESIZE", QT_TRANSLATE_NOOP("KeysConfForm", "resize a window"), 38},
    {"ZEMWM_MINIMIZE", QT_TRANSLATE_NOOP("KeysConfForm", "minimize a window"), 14},
    {"ZEMWM_RESTORE", QT_TRANSLATE_NOOP("KeysConfForm", "restore a window size"), 21},
    {"ZEMWM_MAXIMIZE", QT_TRANSLATE_NOOP("KeysConfForm", "maximize a window"), 15},
    {"ZEMWM_TOGGLE_MAXIMIZE_RESTORE", QT_TRANSLATE_NOOP("KeysConfForm", "maximize/restore a window"), 16},
    {"ZEMWM_TOGGLE_FULLSCREEN", QT_TRANSLATE_NOOP("KeysConfForm", "fullscreen/restore a window"), 17},
    {"ZEMWM_SWALLOW", QT_TRANSLATE_NOOP("KeysConfForm", "swallow to tray"), 18},
    {"ZEMWM_TBTN_LEFT", QT_TRANSLATE_NOOP("KeysConfForm", "move taskbar btn left(up)"), 19},
    {"ZEMWM_TBTN_RIGHT", QT_TRANSLATE_NOOP("KeysConfForm", "move taskbar btn right(down)"), 20},
    {"ZEMWM_EXPAND", QT_TRANSLATE_NOOP("KeysConfForm", "expand a window to all directions"), 22},
    {"ZEMWM_EXPAND_LEFT", QT_TRANSLATE_NOOP("KeysConfForm", "expand a window to a left direction"), 23},
    {"ZEMWM_EXPAND_RIGHT", QT_TRANSLATE_NOOP("KeysConfForm", "expand a window to a right direction"), 24},
    {"ZEMWM_EXPAND_UP", QT_TRANSLATE_NOOP("KeysConfForm", "expand a window to an up direction"), 25},
    {"ZEMWM_EXPAND_DOWN", QT_TRANSLATE_NOOP("KeysConfForm", "expand a window to a down direction"), 26},
    {"ZEMWM_SNAP_RIGHT", QT_TRANSLATE_NOOP("KeysConfForm", "snap a window to a right edge"), 27},
    {"ZEMWM_SNAP_LEFT", QT_TRANSLATE_NOOP("KeysConfForm", "snap a window to a left edge"), 28},
    {"ZEMWM_SNAP_BOTTOM_RIGHT", QT_TRANSLATE_NOOP("KeysConfForm", "snap a window to a bottom right corner"),
     29},
    {"ZEMWM_SNAP_BOTTOM_LEFT", QT_TRANSLATE_NOOP("KeysConfForm", "snap a window to a botton left corner"),
     30},
    {"ZEMWM_SNAP_TOP_RIGHT", QT_TRANSLATE_NOOP("KeysConfForm", "snap a window to a top right corner"), 31},
    {"ZEMWM_SNAP_TOP_LEFT", QT_TRANSLATE_NOOP("KeysConfForm", "snap a window to a top left corner"), 32},
    {"ZEMWM_SNAP_TOP", QT_TRANSLATE_NOOP("KeysConfForm", "snap a window to a top edge"), 33},
    {"ZEMWM_SNAP_BOTTOM", QT_TRANSLATE_NOOP("KeysConfForm", "snap a window to a bottom edge"), 34},
    {"ZEMWM_RAISE", QT_TRANSLATE_NOOP("KeysConfForm", "raise a window"), 39},
    {"ZEMWM_LOWER", QT_TRANSLATE_NOOP("KeysConfForm", "lower a window"), 40},
    {"ZEMWM_CLOSE", QT_TRANSLATE_NOOP("KeysConfForm", "close a window (recommend)"), 41},
    {"ZEMWM_CLOSE_COMBINED", QT_TRANSLATE_NOOP("KeysConfForm", "close all similar window"), 42},
    {"ZEMWM_KILL", QT_TRANSLATE_NOOP("KeysConfForm", "close a window forcely"), 43},
    {"ZEMWM_TOGGLE_ONTOP", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of an ONTOP attribute"), 44},
    {"ZEMWM_TOGGLE_ONBOTTOM", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of an ONBOTTOM attribute"),
     45},
    {"ZEMWM_TOGGLE_STICKY", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a STICKY attribute"), 46},
    {"ZEMWM_TOGGLE_FOCUS", QT_TRANSLATE_NOOP("KeysConfForm", "toggle switch of a focus attribute"), 47},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Window focus"), 0},
    {"ZEMWM_SWITCH_TASK", QT_TRANSLATE_NOOP("KeysConfForm", "switch an active window"), 57},
    {"ZEMWM_SWITCH_TASK_BACK", QT_TRANSLATE_NOOP("KeysConfForm", "switch back an active window"), 58},
    {"ZEMWM_CHANGE_WIN", QT_TRANSLATE_NOOP("KeysConfForm", "change an active window"), 59},
    {"ZEMWM_CHANGE_WIN_BACK", QT_TRANSLATE_NOOP("KeysConfForm", "change back an active window"), 60},
    {"ZEMWM_CHANGE_WIN_INSCR", QT_TRANSLATE_NOOP("KeysConfForm", "change an active window within a screen"),
     61},
    {"ZEMWM_CHANGE_WIN_BACK_INSCR",
     QT_TRANSLATE_NOOP("KeysConfForm", "change back an active window in a screen"), 62},
    {"ZEMWM_DESKTOP_FOCUS", QT_TRANSLATE_NOOP("KeysConfForm", "make the desktop active"), 63},
    {nullptr, QT_TRANSLATE_NOOP("KeysConfForm", "Window Manager"), 0},
    {"ZEMWM_RESTART", QT_TRANSLATE_NOOP("KeysConfForm", "restart zem-wm"), 1},
    {"ZEMWM_LOCK", QT_TRANSLATE_NOOP("KeysConfForm", "lock screen"), 2},
    {"ZEMWM_STANDBY", QT_TRANSLATE_NOOP("KeysConfForm", "standby"), 3},
    {"ZEMWM_SUSPEND", QT_TRANSLATE_NOOP("KeysConfForm", "suspend"), 4},
    {"ZEMWM_HIBERNATE", QT_TRANSLATE_NOOP("KeysConfForm", "hibernate"), 5},
    {"ZEMWM_CHANGE_USER", QT_TRANSLATE_NOOP("KeysConfForm", "change user"), 169},
    {"ZEMWM_CHANGE_USER_IN_LOCKER", QT_TRANSLATE_NOOP("KeysConfForm", "change/switch user"), 170},
    {"ZEMWM_POSTPONE", QT_TRANSLATE_NOOP("KeysConfForm", "postpone session"), 171},
    {"ZEMWM_SCREENSAVER_SUSPEND", QT_TRANSLATE_NOOP("KeysConfForm", "suspend screensaver"), 6},
    {"ZEMWM_SCREENSAVER_RESUME", QT_TRANSLATE_NOOP("KeysConfForm", "resume screensaver"), 7},
    {"ZEMWM_EXIT", QT_TRANSLATE_NOOP("KeysConfForm", "exit zem-wm"), 8},
    {"ZEMWM_REBOOT", QT_TRANSLATE_NOOP("KeysConfForm", "reboot"), 9},
    {"ZEMWM_SHUTDOWN", QT_TRANSLATE_NOOP("KeysConfForm", "shutdown"), 10},
    {"ZEMWM_DPMS_ON", QT_TRANSLATE_NOOP("KeysConfForm", "dpms on"), 11},
    {"ZEMWM_DPMS_OFF", QT_TRANSLATE_NOOP("KeysConfForm", "dpms off"), 12},
    {"ZEMWM_DPMS_TOGGLE", QT_TRANSLATE_NOOP("KeysConfForm", "dpms toggle"), 13},
    {"ZEMWM_PREV_WALLPAPER", QT_TRANSLATE_NOOP("KeysConfForm", "previous wallpaper"), 172},
    {"ZEMWM_NEXT_WALLPAPER", QT_TRANSLATE_NOOP("KeysConfForm", "next wallpaper"), 173},
};

} // namespace

QVector<WmFunctionEntry> buildWmFunctionTable(bool translated)
{
    QVector<WmFunctionEntry> table;
    table.reserve(int(std::size(catalogue)));
    for (const RawEntry& raw : catalogue)
        table.append({raw.keyName,
                      translated ? QCoreApplication::translate("KeysConfForm", raw.text)
                                 : QString::fromLatin1(raw.text),
                      raw.code});
    return table;
}

const QStringList& catalogueFunctionNames()
{
    static const QStringList names = [] {
        QStringList result;
        for (const WmFunctionEntry& entry : buildWmFunctionTable(false)) {
            if (entry.code != 0 && entry.keyName)
                result << QString::fromLatin1(entry.keyName);
        }
        return result;
    }();
    return names;
}

int catalogueFunctionIndex(const QString& name)
{
    static const QHash<QString, int> index = [] {
        QHash<QString, int> result;
        const QStringList& names = catalogueFunctionNames();
        for (int i = 0; i < names.size(); ++i)
            result.insert(names.at(i), i);
        return result;
    }();
    return index.value(name, -1);
}
