// The field in which a folder's name is edited in its row. Enter, Escape and the end of the soft keyboard are
// told, not acted upon: its owner decides when the edit is over. GUI thread.
#pragma once

#include "touchui/OneFinger.h"

#include <QEvent>
#include <QLineEdit>
#include <QPixmap>

class FolderEditor : public QLineEdit
{
    Q_OBJECT

public:
    static const QString FOLDER_PICKER_REGEXP;
    static const QString LEFT_IMAGE;
    static const QString CENTER_IMAGE;
    static const QString RIGHT_IMAGE;

    explicit FolderEditor(QWidget* parent = nullptr);

Q_SIGNALS:
    // What was typed or pasted is refused for its characters, for its length, or taken.
    void signalInvalidInput();
    void signalLongInput();
    void signalValidInput();
    // The editor has left its row, whatever became of the text.
    void signalEditStateEnd();
    void signalPressedEnter();
    void signalPressedEscape();
    // The soft keyboard was closed.
    void signalPressedClose();

protected:
    bool event(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    // The text, its selection and its caret are QLineEdit's, inside this rectangle.
    QRect getTextRect() const;
    void drawFrame(QPainter& painter) const;
    void sendMouse(QEvent::Type type, const QPointF& globalPosition);

    QPixmap mLeft;
    QPixmap mCenter;
    QPixmap mRight;
    OneFinger mFinger{this};
    bool mEnded = false;
};
