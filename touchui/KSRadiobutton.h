#pragma once

#include "touchui/OneFinger.h"

#include <QEvent>
#include <QPixmap>
#include <QRadioButton>

#include <array>

// A radio button that is operated with one finger and painted from the pictures under ":/KSRadioButton" or
// another folder: Radiobutton_On_Rest, Radiobutton_On_Pressed, Radiobutton_On_Disabled and the same with Off.
class KSRadiobutton : public QRadioButton
{
    Q_OBJECT
public:
    explicit KSRadiobutton(QWidget* parent = nullptr);
    explicit KSRadiobutton(const QString& text, QWidget* parent = nullptr);

    // Sets a resource folder with pictures of those names.
    void setImagesPath(const QString& folder);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override { return sizeHint(); }

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    bool hitButton(const QPoint& position) const override;

private:
    void init();
    void sendMouse(QEvent::Type type, const QPointF& position);
    void comeUp();
    QSize pictureSize() const;

    std::array<std::array<QPixmap, 3>, 2> m_pictures; // first index: off, on; second: rest, pressed, disabled
    OneFinger m_finger{this};
};
