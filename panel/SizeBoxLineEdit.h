#pragma once

#include <QLineEdit>

// The field of the size box: it paints its text and its selection itself, in the middle of the drawn box.
class SizeBoxLineEdit : public QLineEdit
{
    Q_OBJECT
public:
    explicit SizeBoxLineEdit(QWidget* parent = nullptr);

    // 1 is enabled; any other value paints the text grey.
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
