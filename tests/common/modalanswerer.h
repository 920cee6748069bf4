#pragma once

#include <QMessageBox>
#include <QObject>
#include <QPointer>
#include <QStringList>
#include <QTimer>

// Answers the modal message boxes that code under test opens, so that no test ever waits on
// one. Each box met is recorded (title, text, parent) and answered with the button asked for.
class ModalAnswerer : public QObject
{
    Q_OBJECT

public:
    struct Box {
        QString title;
        QString text;
        QWidget* parent = nullptr;
        QMessageBox::StandardButtons buttons;
        QMessageBox::StandardButton defaultButton = QMessageBox::NoButton;
    };

    // Boxes are answered in the order given; once the list is used up, with the last answer.
    explicit ModalAnswerer(QList<QMessageBox::StandardButton> answers = {QMessageBox::Ok});
    ~ModalAnswerer() override;

    const QList<Box>& boxes() const { return seen; }
    int count() const { return seen.size(); }
    const Box& last() const { return seen.last(); }

private:
    void poll();

    QList<QMessageBox::StandardButton> answers;
    QList<Box> seen;
    QTimer timer;
};
