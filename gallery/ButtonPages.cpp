// Pages of buttons, sliders and radio buttons.
#include "gallery/GalleryPages.h"

#include "touchui/KSPushbutton.h"
#include "touchui/KSRadiobutton.h"
#include "touchui/KSSLider.h"

#include <QIcon>
#include <QLabel>

namespace
{

const QSize PAGE(960, 640);

// Returns the image string of a family from its folder and the names of its plain and its selected pictures.
QString buttonImages(const QString& folder, const QString& rest, const QString& selected)
{
    QString images = folder;
    for (const QString& base : {rest, selected}) {
        for (const char* state : {"Rest", "Pressed", "Disabled"})
            for (const char* slice : {"Left", "Center", "Right"})
                images += QStringLiteral(":%1_%2_%3").arg(base, QLatin1String(state), QLatin1String(slice));
    }
    return images;
}

// Makes a button that shows when it is pressed.
KSPushbutton* liveButton(const QString& images, const QString& text, QWidget* parent)
{
    auto* button = new KSPushbutton(images, text, parent);
    button->setObjectName(QStringLiteral("live"));
    QObject::connect(button, &QAbstractButton::pressed, button,
                     [button] { button->changeButtonState(KSPushbutton::ButtonPressed); });
    QObject::connect(button, &QAbstractButton::released, button,
                     [button] { button->changeButtonState(KSPushbutton::ButtonRest); });
    return button;
}

const char* const STATES[] = {"rest",     "pressed",          "disabled",
                              "selected", "selected pressed", "selected disabled"};

KSSLider* slider(const GalleryPage& page, const QString& images, const QRect& place,
                 Qt::Orientation orientation = Qt::Horizontal)
{
    auto* result = new KSSLider(images, orientation, page.window.get());
    result->setRange(1, 10);
    result->setPageStep(1);
    result->setGeometry(place);
    return result;
}

} // namespace

GalleryPage GalleryPages::pushButtons()
{
    GalleryPage page(QStringLiteral("buttons"), PAGE);
    const struct {
        const char* caption;
        QString images;
        int height;
    } families[] = {
        {"48 high",
         buttonImages(QStringLiteral("TextToolPanel_Buttons"), QStringLiteral("Button_48"),
                      QStringLiteral("Button_48selected")),
         48},
        {"38 high",
         buttonImages(QStringLiteral("TextToolPanel_Buttons"), QStringLiteral("Button-38B"),
                      QStringLiteral("Button-38selected")),
         38},
        {"67 high, tools",
         buttonImages(QStringLiteral("ToolsBar_Buttons"), QStringLiteral("Button_67"),
                      QStringLiteral("Button_67selected")),
         67},
    };
    for (int state = 0; state < KSPushbutton::ButtonStateCount; ++state)
        page.caption(QPoint(20 + 155 * state, 12), QLatin1String(STATES[state]));
    int y = 40;
    for (const auto& family : families) {
        for (int state = 0; state < KSPushbutton::ButtonStateCount; ++state) {
            auto* button = new KSPushbutton(family.images, QStringLiteral("Edge"), page.window.get());
            button->setGeometry(20 + 155 * state, y, 140, family.height);
            button->changeButtonState(state);
        }
        y += family.height + 16;
        page.caption(QPoint(20, y - 12), QLatin1String(family.caption));
        y += 24;
    }
    // Buttons with an icon and with left-aligned text, a narrow and a wide one.
    auto* icon = new KSPushbutton(families[0].images, page.window.get());
    icon->setIcon(QIcon(QStringLiteral(":/TextToolPanel_Buttons/Icon_SizeUp")));
    icon->setIconSize(QSize(48, 48));
    icon->setGeometry(20, 380, 73, 48);
    auto* left = new KSPushbutton(families[0].images, QStringLiteral("Left"), page.window.get());
    left->setTextAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    left->setGeometry(110, 380, 140, 48);
    auto* narrow = new KSPushbutton(families[0].images, page.window.get());
    narrow->setGeometry(270, 380, 24, 48);
    auto* wide = new KSPushbutton(families[0].images, QStringLiteral("Wide"), page.window.get());
    wide->setGeometry(310, 380, 630, 48);
    page.caption(QPoint(20, 460),
                 QStringLiteral("to be pressed: at rest, held, with a touch rectangle, disabled"));
    for (int i = 0; i < 4; ++i) {
        KSPushbutton* live = liveButton(families[0].images, QStringLiteral("Press me"), page.window.get());
        live->setGeometry(20 + 220 * i, 500, 200, 48);
        if (i == 2)
            live->setTouchRect(live->rect().adjusted(-20, -20, 20, 20));
        live->setEnabled(i != 3);
    }
    QWidget* held = page.window->childAt(QPoint(260, 520));
    page.pose = [held](Fingers& fingers) { fingers.pressWidget(0, held, QPoint(80, 20)); };
    return page;
}

GalleryPage GalleryPages::slidersAndRadioButtons()
{
    GalleryPage page(QStringLiteral("sliders"), PAGE);
    const QString images =
        QStringLiteral("Slider:Slider_S_Handle_Rest:Slider_S_Handle_Pressed:Slider_S_Handle_Rest:"
                       "Slider_H_S_Left:Slider_H_S_Center:Slider_H_S_Right");
    page.caption(QPoint(20, 12), QStringLiteral("at rest"));
    slider(page, images, QRect(20, 40, 400, 60))->setValue(3);
    page.caption(QPoint(20, 112), QStringLiteral("marks below, at the end"));
    KSSLider* below = slider(page, images, QRect(20, 140, 257, 60));
    below->setTick(1, QSlider::TicksBelow);
    below->setValue(10);
    page.caption(QPoint(20, 212), QStringLiteral("marks above"));
    KSSLider* above = slider(page, images, QRect(20, 240, 257, 60));
    above->setTick(1, QSlider::TicksAbove);
    above->setValue(5);
    page.caption(QPoint(20, 312), QStringLiteral("disabled"));
    KSSLider* disabled = slider(page, images, QRect(20, 340, 400, 60));
    disabled->setValue(7);
    disabled->setEnabled(false);
    page.caption(QPoint(20, 452), QStringLiteral("held, with its balloon"));
    KSSLider* held = slider(page, images, QRect(20, 540, 400, 60));
    held->setValue(6);
    page.caption(QPoint(450, 12), QStringLiteral("upright, plain"));
    slider(page, QString(), QRect(500, 40, 60, 250), Qt::Vertical)->setValue(4);

    page.caption(QPoint(620, 12), QStringLiteral("radio buttons: at rest"));
    auto* group = new QWidget(page.window.get());
    group->setGeometry(620, 40, 320, 60);
    const auto radio = [](QWidget* parent, int x, const QString& text) {
        auto* button = new KSRadiobutton(text, parent);
        button->setGeometry(x, 0, 140, 60);
        return button;
    };
    radio(group, 0, QStringLiteral("2px"))->setChecked(true);
    radio(group, 160, QStringLiteral("10px"));
    page.caption(QPoint(620, 112), QStringLiteral("disabled"));
    auto* disabledGroup = new QWidget(page.window.get());
    disabledGroup->setGeometry(620, 140, 320, 60);
    radio(disabledGroup, 0, QStringLiteral("2px"))->setChecked(true);
    radio(disabledGroup, 160, QStringLiteral("10px"));
    disabledGroup->setEnabled(false);
    page.caption(QPoint(620, 212), QStringLiteral("held"));
    auto* heldGroup = new QWidget(page.window.get());
    heldGroup->setGeometry(620, 240, 320, 60);
    KSRadiobutton* on = radio(heldGroup, 0, QStringLiteral("2px"));
    on->setChecked(true);
    KSRadiobutton* off = radio(heldGroup, 160, QStringLiteral("10px"));
    page.pose = [held, on, off](Fingers& fingers) {
        fingers.pressWidget(0, held, held->handleRect().center());
        fingers.pressWidget(1, on, QPoint(20, 30));
        fingers.pressWidget(2, off, QPoint(20, 30));
    };
    return page;
}
