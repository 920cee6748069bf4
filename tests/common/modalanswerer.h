#pragma once

#include <QMessageBox>
#include <QObject>
#include <QPointer>
#include <QStringList>
#include <QTimer>

#include <functional>

class QDialog;

// Answers the modal message boxes and dialogs that code under test opens, so that no test ever
// waits on one. Each box met is recorded (title, text, parent) and answered with the button
// asked for. When several answerers live at once, the one made last answers.
class ModalAnswerer : public QObject
{
    Q_OBJECT

public:
    struct Box
    {
        QString title;
        QString text;
        QWidget* parent = nullptr;
        QMessageBox::StandardButtons buttons;
        QMessageBox::StandardButton defaultButton = QMessageBox::NoButton;
    };

    struct FileDialog
    {
        QString caption;
        QString directory;
        bool forSaving = false;
        QSize size;
        bool listView = false;
    };

    // Boxes are answered in the order given; once the list is used up, with the last answer.
    // File dialogs take the paths in order; an empty path (or none left) cancels the dialog.
    explicit ModalAnswerer(QList<QMessageBox::StandardButton> answers = {QMessageBox::Ok},
                           QStringList files = {});
    ~ModalAnswerer() override;

    const QList<Box>& boxes() const { return seen; }
    int count() const { return seen.size(); }
    const Box& last() const { return seen.last(); }
    QStringList titles() const;
    const QList<FileDialog>& fileDialogs() const { return dialogs; }
    // Any other modal dialog is handed to this function, which must close it.
    void onOtherDialog(std::function<void(QDialog*)> handler) { otherDialogs = std::move(handler); }
    int otherDialogCount() const { return othersSeen; }

private:
    static QList<ModalAnswerer*>& live();
    void poll();

    QList<QMessageBox::StandardButton> answers;
    QStringList files;
    QList<Box> seen;
    QList<FileDialog> dialogs;
    std::function<void(QDialog*)> otherDialogs;
    int othersSeen = 0;
    QTimer timer;
};
