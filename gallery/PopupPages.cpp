// Pages of combo boxes, menus and balloons, which open next to their owner.
#include "gallery/GalleryPages.h"

#include "touchui/Balloon.h"
#include "touchui/CustomComboBoxView.h"
#include "touchui/KSCombobox.h"
#include "touchui/KSMenu.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSToolTip.h"

#include <QLabel>
#include <QLineEdit>
#include <QStandardItemModel>

namespace
{

const QSize PAGE(960, 640);

KSCombobox* comboBox(const GalleryPage& page, const QRect& place, const QStringList& rows)
{
    auto* box = new KSCombobox(page.window.get());
    box->setGeometry(place);
    box->addItems(rows);
    return box;
}

QStringList numbered(const QString& text, int count)
{
    QStringList rows;
    for (int i = 1; i <= count; ++i)
        rows.append(text.arg(i));
    return rows;
}

// Makes a button that opens a menu like that of the title list.
KSMenu* menuAt(const GalleryPage& page, const QPoint& place, const QString& text, int alignment)
{
    auto* button =
        new KSPushbutton(QString::fromLatin1(KSPushbutton::STANDARD_IMAGES), text, page.window.get());
    button->setGeometry(QRect(place, QSize(140, 48)));
    auto* menu = new KSMenu(page.window.get());
    for (const char* name : {"Create New", "Copy", "Paste", "Delete"})
        menu->addAction(QLatin1String(name));
    menu->actions().at(2)->setEnabled(false);
    menu->setBalloonAlignment(alignment);
    QObject::connect(button, &QAbstractButton::clicked, menu, [button, menu, alignment] {
        const bool below = alignment & MenuPlacement::Below;
        menu->popup(button->mapToGlobal(QPoint(70, below ? 48 : (alignment == 0 ? 0 : 24))));
    });
    return menu;
}

} // namespace

GalleryPage GalleryPages::comboBoxes()
{
    GalleryPage page(QStringLiteral("comboboxes"), PAGE);
    page.caption(QPoint(20, 12), QStringLiteral("open, 40 rows, one held"));
    KSCombobox* open = comboBox(page, QRect(20, 40, 240, 48), numbered(QStringLiteral("Family %1"), 40));
    open->setMaxVisibleItems(8);
    open->setCurrentIndex(2);
    qobject_cast<QStandardItemModel*>(open->model())->item(1)->setEnabled(false);
    page.caption(QPoint(320, 12), QStringLiteral("list as wide as its text"));
    KSCombobox* byText =
        comboBox(page, QRect(320, 40, 120, 48),
                 {QStringLiteral("32"), QStringLiteral("A longer row than the box"), QStringLiteral("40")});
    byText->setListWidthByText(true);
    page.caption(QPoint(320, 352), QStringLiteral("colours, list above"));
    KSCombobox* colors =
        comboBox(page, QRect(320, 580, 200, 48),
                 {QStringLiteral("#C80000"), QStringLiteral("#FFF700"), QStringLiteral("#2987F2")});
    colors->setColorPallete(true);
    colors->setPopupUpper(true);
    page.caption(QPoint(700, 12), QStringLiteral("at rest, disabled, editable, empty"));
    comboBox(page, QRect(700, 40, 214, 48), {QStringLiteral("KST Medium")});
    comboBox(page, QRect(700, 110, 214, 48), {QStringLiteral("KST Medium")})->setEnabled(false);
    KSCombobox* editable =
        comboBox(page, QRect(700, 180, 214, 48), {QStringLiteral("64"), QStringLiteral("66")});
    editable->setEditable(true);
    comboBox(page, QRect(700, 250, 214, 48), {});
    page.pose = [open, byText, colors](Fingers& fingers) {
        open->showPopup();
        fingers.pressWidget(0, open->listView()->viewport(), QPoint(40, 56 * 4 + 20));
        byText->showPopup();
        colors->showPopup();
    };
    return page;
}

GalleryPage GalleryPages::menus()
{
    GalleryPage page(QStringLiteral("menus"), QSize(1280, 720));
    KSMenu* below = menuAt(page, QPoint(60, 20), QStringLiteral("Below"), MenuPlacement::Below);
    KSMenu* starting = menuAt(page, QPoint(360, 20), QStringLiteral("Starting"),
                              MenuPlacement::Below | MenuPlacement::Horizontal);
    KSMenu* beside = menuAt(page, QPoint(640, 300), QStringLiteral("Beside"), MenuPlacement::Above);
    KSMenu* left = menuAt(page, QPoint(1120, 300), QStringLiteral("Beside"), MenuPlacement::Above);
    KSMenu* over = menuAt(page, QPoint(60, 660), QStringLiteral("Over"), 0);
    KSMenu* bottom = menuAt(page, QPoint(640, 660), QStringLiteral("Bottom"), MenuPlacement::Above);
    const QList<KSMenu*> menus = {below, starting, beside, left, over, bottom};
    page.pose = [menus, window = page.window.get()](Fingers& fingers) {
        const QPoint anchors[] = {QPoint(130, 68),   QPoint(430, 68),  QPoint(710, 324),
                                  QPoint(1190, 324), QPoint(130, 660), QPoint(710, 684)};
        for (int i = 0; i < menus.size(); ++i) {
            menus.at(i)->popup(window->mapToGlobal(anchors[i]));
            if (i == 0) // pressed while it is the only menu: a press would close the others
                fingers.pressWidget(0, menus.at(0), menus.at(0)->getMenuItemRect(1).center());
        }
    };
    return page;
}

GalleryPage GalleryPages::balloons()
{
    GalleryPage page(QStringLiteral("balloons"), PAGE);
    const auto anchor = [&page](const QRect& place, const QString& text) {
        auto* button =
            new KSPushbutton(QString::fromLatin1(KSPushbutton::STANDARD_IMAGES), text, page.window.get());
        button->setGeometry(place);
        return button;
    };
    QWidget* window = page.window.get();
    QWidget* tip = anchor(QRect(60, 120, 140, 48), QStringLiteral("Tool tip"));
    QWidget* button = anchor(QRect(300, 60, 140, 48), QStringLiteral("Button"));
    QWidget* bottom = anchor(QRect(800, 580, 140, 48), QStringLiteral("At the edge"));
    QWidget* prompt = anchor(QRect(300, 400, 300, 48), QStringLiteral("Prompt"));
    QWidget* top = anchor(QRect(600, 10, 340, 48), QStringLiteral("Prompt at the top"));
    QList<Balloon*> list;
    for (int i = 0; i < 4; ++i)
        list.append(new Balloon(window));
    page.pose = [=](Fingers&) {
        KSToolTip::showText(QRect(tip->mapToGlobal(QPoint(0, 0)), tip->size()), QStringLiteral("10 px"));
        list.at(0)->showButtonText(button, QStringLiteral("Delete"));
        list.at(1)->showButtonText(bottom, QStringLiteral("No room under it"));
        list.at(2)->showPromptText(
            prompt, QStringLiteral("This name has been taken already.\nPlease enter another one, of up to "
                                   "20 characters, and without a slash."));
        list.at(3)->showPromptText(top, QStringLiteral("No room above it"));
    };
    return page;
}
