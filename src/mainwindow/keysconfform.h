#pragma once

#include <QMainWindow>
#include <QStringList>

// The editor's main window: the binding tree of window-manager functions and command entries,
// the key panel below it, and the file commands.
class KeysConfForm : public QMainWindow
{
    Q_OBJECT
    Q_DISABLE_COPY(KeysConfForm)

public:
    explicit KeysConfForm(QWidget* parent = nullptr, Qt::WindowFlags flags = Qt::WindowFlags());
    ~KeysConfForm() override;

    // Reads the hotkeys file into the tree; false, with nothing changed, when it cannot be read.
    bool loadFile(const QString& path);
    void updateTitle();

    static bool isModified() { return modified; }
    static QString editedFile() { return currentFile; }
    QStringList disabledKeyList() const { return disabledKeys; }

public slots:
    virtual void fileChanged();
    virtual bool init(QString filepath);
    bool messageReceived(const QString& message);

private:
    QStringList disabledKeys;

    // One main window per process: its editing state is class-wide.
    static QString userSource;
    static QString systemSource;
    static bool modified;
    static QString currentFile;
    static QString startupFile;
};
