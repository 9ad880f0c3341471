#include "resources/artwork/Specimen.h"

#include "resources/artwork/ArtworkTable.h"
#include "resources/artwork/DesignTokens.h"

#include <QHash>
#include <QPainter>

namespace
{

QImage paint(const Picture& picture)
{
    QImage image(picture.size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    picture.draw(painter);
    return image;
}

// All pictures by name.
class Gallery
{
public:
    Gallery()
    {
        for (const Picture& picture : artworkTable()) {
            m_images.insert(picture.name, paint(picture));
        }
    }
    QImage image(const QString& name) const { return m_images.value(name); }
    void draw(QPainter& painter, const QPoint& at, const QString& name) const
    {
        painter.drawImage(at, image(name));
    }
    void drawThree(QPainter& painter, const QRect& area, const QString& base) const
    {
        const QImage left = image(base + QStringLiteral("Left"));
        const QImage right = image(base + QStringLiteral("Right"));
        painter.drawImage(area.topLeft(), left);
        painter.drawImage(QRect(area.x() + left.width(), area.y(),
                                area.width() - left.width() - right.width(), area.height()),
                          image(base + QStringLiteral("Center")));
        painter.drawImage(QPoint(area.right() + 1 - right.width(), area.y()), right);
    }
    void drawNine(QPainter& painter, const QRect& area, const QString& prefix) const
    {
        const QStringList names = nineNames();
        const QSize corner = image(prefix + names.at(0)).size();
        const int xs[] = {area.x(), area.x() + corner.width(), area.right() + 1 - corner.width(),
                          area.right() + 1};
        const int ys[] = {area.y(), area.y() + corner.height(), area.bottom() + 1 - corner.height(),
                          area.bottom() + 1};
        for (int row = 0; row < 3; ++row) {
            for (int column = 0; column < 3; ++column) {
                painter.drawImage(
                    QRect(xs[column], ys[row], xs[column + 1] - xs[column], ys[row + 1] - ys[row]),
                    image(prefix + names.at(row * 3 + column)));
            }
        }
    }

private:
    QHash<QString, QImage> m_images;
};

QImage emptyPage(int width, int height)
{
    QImage page(width, height, QImage::Format_RGB32);
    page.fill(Tokens::PANEL);
    return page;
}

void label(QPainter& painter, const QRect& area, const QString& text, const QColor& color, int pixelSize)
{
    QFont font = painter.font();
    font.setPixelSize(pixelSize);
    painter.setFont(font);
    painter.setPen(color);
    painter.drawText(area, Qt::AlignCenter, text);
}

QColor labelColor(const QString& state)
{
    return state.contains(QLatin1String("Disabled"))   ? Tokens::TEXT_DISABLED
           : state.contains(QLatin1String("selected")) ? Tokens::TEXT_SELECTED
                                                       : Tokens::TEXT;
}

const char* const BUTTON_STATES[] = {"_Rest",         "_Pressed",         "_Disabled",
                                     "selected_Rest", "selected_Pressed", "selected_Disabled"};

void drawButtons(QPainter& painter, const Gallery& gallery)
{
    int x = 20;
    for (const char* name : BUTTON_STATES) {
        const QString state = QLatin1String(name);
        const QRect area(x, 20, 160, 48);
        gallery.drawThree(painter, area,
                          QStringLiteral("TextToolPanel_Buttons/Button_48") + state + QLatin1Char('_'));
        label(painter, area, state.mid(state.indexOf(QLatin1Char('_')) + 1), labelColor(state), 24);
        const QRect small(x, 84, 70, 38);
        const QString family = state.startsWith(QLatin1Char('_'))
                                   ? QStringLiteral("TextToolPanel_Buttons/Button-38B")
                                   : QStringLiteral("TextToolPanel_Buttons/Button-38");
        gallery.drawThree(painter, small, family + state + QLatin1Char('_'));
        label(painter, small, QStringLiteral("Move"), labelColor(state), 20);
        const QRect tool(x + 80, 84, 120, 67);
        gallery.drawThree(painter, tool,
                          QStringLiteral("ToolsBar_Buttons/Button_67") + state + QLatin1Char('_'));
        gallery.draw(painter, tool.topLeft(), QStringLiteral("Icon_Undo"));
        x += 200;
    }
}

void drawIcons(QPainter& painter, const Gallery& gallery)
{
    int x = 20;
    for (const char* name :
         {"SizeDown", "SizeUp", "KerningSmaller", "KerningLarger", "MoveUp", "MoveRight", "MoveDown",
          "MoveLeft", "AlignLeft", "AlignCenter", "AlignRight", "Bold", "Italic", "EdgeOff", "EdgeOn",
          "ShadowOff", "ShadowRight", "ShadowCenter", "ShadowLeft"}) {
        const QString icon = QStringLiteral("TextToolPanel_Buttons/Icon_") + QLatin1String(name);
        int y = 170;
        for (const char* form :
             {"_Rest", "_Pressed", "_Disabled", "selected_Rest", "selected_Pressed", "selected_Disabled"}) {
            const QString state = QLatin1String(form);
            const QString suffix = state.contains(QLatin1String("Disabled"))   ? QStringLiteral("_Disabled")
                                   : state.contains(QLatin1String("selected")) ? QStringLiteral("_Selected")
                                                                               : QString();
            const QRect area(x, y, 56, 48);
            if (!gallery.image(icon + suffix).isNull()) {
                gallery.drawThree(painter, area,
                                  QStringLiteral("TextToolPanel_Buttons/Button_48") + state +
                                      QLatin1Char('_'));
                gallery.draw(painter, area.topLeft() + QPoint(4, 0), icon + suffix);
            }
            y += 54;
        }
        x += 62;
    }
}

void drawMarks(QPainter& painter, const Gallery& gallery)
{
    int x = 20;
    const auto next = [&](const QString& name) {
        gallery.draw(painter, QPoint(x, 510), name);
        x += gallery.image(name).width() + 6;
    };
    for (const char* kind : {"CheckBox/Checkbox_On", "CheckBox/Checkbox_Off", "CheckBox/Checkbox_Partial",
                             "RadioButton/Radiobutton_On", "RadioButton/Radiobutton_Off", "Views/Parts_011",
                             "Views/Parts_012"}) {
        for (const char* state : {"_Rest", "_Pressed", "_Disabled"}) {
            next(QLatin1String(kind) + QLatin1String(state));
        }
        x += 14;
    }
    next(QStringLiteral("Picker/Picker_Allow_Up_Rest"));
    next(QStringLiteral("Picker/Picker_Allow_Dn_Rest"));
    next(QStringLiteral("FolderPicker/Picker_Icon_Enabel"));
    next(QStringLiteral("Views/Recording_Icon"));
    next(QStringLiteral("Views/Loading_Icon-01"));
    next(QStringLiteral("Views/Loading_Icon-04"));
    next(QStringLiteral("MainButtons/Main_Move_Handle"));
}

void drawScrollBar(QPainter& painter, const Gallery& gallery, const QRect& area, const QString& state)
{
    const QString base = QStringLiteral("Scrollbar/Scbar_handle_v_") + state;
    painter.drawImage(area, gallery.image(QStringLiteral("Scrollbar/Scbar_base_v")));
    const QRect slider(area.x(), area.y() + 60, 32, 120);
    gallery.draw(painter, slider.topLeft(), base + QStringLiteral("_upper"));
    painter.drawImage(slider.adjusted(0, 12, 0, -12), gallery.image(base + QStringLiteral("_center")));
    gallery.draw(painter, slider.topLeft() + QPoint(0, 53), base + QStringLiteral("_center_interval"));
    gallery.draw(painter, QPoint(slider.x(), slider.bottom() - 11), base + QStringLiteral("_bottom"));
}

void drawBoxes(QPainter& painter, const Gallery& gallery)
{
    int x = 20;
    for (const char* base :
         {"TextToolPanel_TextBox/TextBox_Edittable_", "TextToolPanel_TextBox/TextBox_Edittable_Disable_"}) {
        const QString name = QLatin1String(base);
        const QRect area(x, 20, 214, 48);
        gallery.drawThree(painter, area, name);
        const QRect combo(x, 80, 71, 48);
        gallery.draw(painter, combo.topLeft(), name + QStringLiteral("Left"));
        painter.drawImage(QRect(combo.x() + 8, combo.y(), 71 - 32, 48),
                          gallery.image(name + QStringLiteral("Center")));
        gallery.draw(painter, combo.topLeft() + QPoint(71 - 24, 0), name + QStringLiteral("Pulldown"));
        label(painter, combo.adjusted(0, 0, -22, 0), QStringLiteral("999"), labelColor(name), 22);
        x += 230;
    }
    const QRect groove(20, 160, 257, 12);
    gallery.drawThree(painter, groove, QStringLiteral("Slider/Slider_H_S_"));
    gallery.draw(painter, QPoint(60, 148), QStringLiteral("Slider/Slider_S_Handle_Rest"));
    gallery.draw(painter, QPoint(180, 148), QStringLiteral("Slider/Slider_S_Handle_Pressed"));
    gallery.drawThree(painter, QRect(20, 200, 505, 139), QStringLiteral("MainButtons/Main_drag_base_"));
    gallery.draw(painter, QPoint(26, 258), QStringLiteral("MainButtons/Main_Move_Handle"));
    drawScrollBar(painter, gallery, QRect(540, 20, 32, 320), QStringLiteral("rest"));
    drawScrollBar(painter, gallery, QRect(590, 20, 32, 320), QStringLiteral("pressed"));
}

void drawBalloons(QPainter& painter, const Gallery& gallery)
{
    const QString prefix = QStringLiteral("ToolTip/Balloon_Common_");
    const QRect above(650, 40, 220, 60);
    gallery.drawNine(painter, above, prefix);
    gallery.draw(painter, QPoint(740, 28), prefix + QStringLiteral("Upper_Center_Allow-02"));
    label(painter, above, QStringLiteral("Folder name"), Tokens::TEXT, 29);
    const QRect below(890, 28, 220, 60);
    gallery.drawNine(painter, below, prefix);
    gallery.draw(painter, QPoint(990, 72), prefix + QStringLiteral("Bottom_Center_Allow"));
    label(painter, below, QStringLiteral("12 px"), Tokens::TEXT, 29);
    const QRect menu(650, 140, 300, 196);
    gallery.drawNine(painter, menu, QStringLiteral("Dialog/dialog_base_"));
    gallery.draw(painter, QPoint(700, 128), QStringLiteral("Menu/context_menu_allow"));
    for (int row = 0; row < 3; ++row) {
        const QRect area(menu.x() + 8, menu.y() + 8 + row * 62, menu.width() - 16, 60);
        if (row == 1) {
            painter.drawImage(area, gallery.image(QStringLiteral("Menu/List_Cursor")));
        }
        if (row > 0) {
            painter.drawImage(QRect(area.x(), area.y() - 2, area.width(), 2),
                              gallery.image(QStringLiteral("Menu/Separator_H")));
        }
        label(painter, area, QStringLiteral("Create New"), row == 2 ? Tokens::TEXT_DISABLED : Tokens::TEXT,
              28);
    }
}

void drawTabs(QPainter& painter, const Gallery& gallery)
{
    gallery.drawNine(painter, QRect(20, 360 + 50, 900, 160), QStringLiteral("Pane_Tab/Pane_"));
    int x = 20;
    for (const char* state : {"Selected", "Rest", "Pressed", "Disabled"}) {
        const QRect area(x, 360, 180, 52);
        gallery.drawThree(painter, area,
                          QStringLiteral("Pane_Tab/Tab_") + QLatin1String(state) + QLatin1Char('_'));
        label(painter, area, QLatin1String(state),
              QLatin1String(state) == QLatin1String("Disabled") ? Tokens::TEXT_DISABLED
                                                                : QColor(160, 160, 160),
              24);
        x += 180;
    }
    painter.drawImage(QRect(40, 430, 600, 40), gallery.image(QStringLiteral("Views/Header_Main_1")));
    gallery.draw(painter, QPoint(600, 440), QStringLiteral("Picker/Picker_Allow_Up_Rest"));
    painter.drawImage(QRect(40, 472, 600, 44), gallery.image(QStringLiteral("Views/List_Cursor")));
    gallery.draw(painter, QPoint(40, 476), QStringLiteral("Views/Parts_012_Rest"));
    gallery.draw(painter, QPoint(80, 480), QStringLiteral("FolderPicker/Picker_Icon_Enabel"));
    painter.drawImage(QRect(40, 560 - 4, 600, 4), gallery.image(QStringLiteral("Pane_Tab/Separator_H")));
    painter.drawImage(QRect(960, 360, 200, 200),
                      gallery.image(QStringLiteral("ToolBarbg_bluegrid")).copy(0, 0, 200, 200));
}

} // namespace

QImage Specimen::sheet()
{
    constexpr int WIDTH = 1500;
    constexpr int HEIGHT = 4000;
    constexpr int GAP = 14;
    constexpr int LABEL = 12;
    constexpr int LARGEST = 320;
    QImage page = emptyPage(WIDTH, HEIGHT);
    QPainter painter(&page);
    painter.setPen(Tokens::TEXT);
    QFont font = painter.font();
    font.setPixelSize(9);
    painter.setFont(font);
    QPoint at(GAP, GAP);
    int rowHeight = 0;
    for (const Picture& picture : artworkTable()) {
        QImage image = paint(picture);
        if (image.width() > LARGEST) {
            image = image.scaledToWidth(LARGEST, Qt::SmoothTransformation);
        }
        const int cell = qMax(image.width(), 150);
        if (at.x() + cell > WIDTH) {
            at = QPoint(GAP, at.y() + rowHeight + LABEL + GAP);
            rowHeight = 0;
        }
        painter.drawImage(at, image);
        painter.drawText(QRect(at.x(), at.y() + image.height() + 1, cell + GAP, LABEL), Qt::AlignLeft,
                         picture.name.section(QLatin1Char('/'), -1));
        rowHeight = qMax(rowHeight, image.height());
        at.rx() += cell + GAP;
    }
    painter.end();
    return page.copy(0, 0, WIDTH, at.y() + rowHeight + LABEL + GAP);
}

QImage Specimen::faces()
{
    const Gallery gallery;
    QImage page = emptyPage(1220, 560);
    QPainter painter(&page);
    drawButtons(painter, gallery);
    drawIcons(painter, gallery);
    drawMarks(painter, gallery);
    return page;
}

QImage Specimen::frames()
{
    const Gallery gallery;
    QImage page = emptyPage(1180, 590);
    QPainter painter(&page);
    drawBoxes(painter, gallery);
    drawBalloons(painter, gallery);
    drawTabs(painter, gallery);
    return page;
}
