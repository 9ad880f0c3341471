#pragma once

#include "touchui/OneFinger.h"

#include <QEvent>
#include <QLineEdit>
#include <QPixmap>

// The field in which a folder's name is edited in its row. It only reports Enter, Escape and the closing of
// the soft keyboard; its owner ends the edit. GUI thread.
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
    // Emitted when the text typed or pasted contains refused characters, is too long, or is valid.
    void signalInvalidInput();
    void signalLongInput();
    void signalValidInput();
    // Emitted when the editor was removed from its row, with or without a change of the name.
    void signalEditStateEnd();
    void signalPressedEnter();
    void signalPressedEscape();
    // Emitted when the soft keyboard was closed.
    void signalPressedClose();

protected:
    bool event(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    // Returns the rectangle in which QLineEdit draws the text, the selection and the caret.
    QRect getTextRect() const;
    void drawFrame(QPainter& painter) const;
    void sendMouse(QEvent::Type type, const QPointF& globalPosition);

    QPixmap m_left;
    QPixmap m_center;
    QPixmap m_right;
    OneFinger m_finger{this};
    bool m_ended = false;
};
