#pragma once

#include <QLineEdit>

// The field of the size box: paints its text and its selection itself, centred in the drawn box.
class SizeBoxLineEdit : public QLineEdit
{
    Q_OBJECT
public:
    explicit SizeBoxLineEdit(QWidget* parent = nullptr);

    // Sets the look: 1 is enabled; any other value makes the text grey.
    void setState(int state);
    int state() const { return m_state; }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QRect getTextRect() const;
    void drawSelection(QPainter& painter) const;
    void drawText(QPainter& painter) const;

    int m_state = 0;
};
