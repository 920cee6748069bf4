#pragma once

#include <QMessageBox>
#include <QObject>
#include <QStringList>
#include <QTimer>

#include <functional>

class QDialog;

// Answers the modal message boxes and dialogs that code under test opens, so that no test ever
// waits on one. Each box met is recorded (title and text) and answered with the button asked
// for; file dialogs take the paths given, in order; any other dialog goes to a handler.
class ModalAnswerer : public QObject
{
    Q_OBJECT

public:
    struct Box
    {
        QString title;
        QString text;
    };

    // Boxes are answered in the order given; once the list is used up, with the last answer.
    // An empty path (or none left) cancels a file dialog.
    explicit ModalAnswerer(QList<QMessageBox::StandardButton> answers = {QMessageBox::Ok},
                           QStringList files = {});

    int count() const { return seen.size(); }
    const Box& last() const { return seen.last(); }
    QStringList titles() const;
    // Any other modal dialog is handed to this function, which must close it.
    void onOtherDialog(std::function<void(QDialog*)> handler) { otherDialogs = std::move(handler); }

private:
    void poll();

    QList<QMessageBox::StandardButton> answers;
    QStringList files;
    QList<Box> seen;
    std::function<void(QDialog*)> otherDialogs;
    QTimer timer;
};
