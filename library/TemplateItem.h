#pragma once

#include "touchui/TouchEventButton.h"

#include <QString>

class UserTemplateMenu;

// One thumbnail in the template picker: the picture of a template on a checker pattern, with a frame when it
// is selected. The picture is read when the item is first painted.
class TemplateItem : public TouchEventButton
{
    Q_OBJECT

public:
    static const int WIDGET_WIDTH = 248;
    static const int WIDGET_HEIGHT = 143;

    // index: position in the picker's list of templates.
    TemplateItem(int index, bool isUser, QWidget* parent = nullptr);

    int getIndex() const { return m_index; }
    void setIndex(int index) { m_index = index; }
    bool isUser() const { return m_isUser; }

    // Sets the path of a picture of 240 x 135 pixels; larger ones are scaled down. Only the checker pattern
    // is shown when there is no path, or when the picture cannot be read or is too large for a thumbnail.
    void setImage(QString path);
    void setNormalStyle();
    void setSelectedStyle();

    // Called on a tap: shows the selected style and emits itemSelected().
    void clickTriggered();
    // Opens the option menu at a user template; does nothing for a preset.
    void showMenu();

Q_SIGNALS:
    void itemSelected(int index, TemplateItem* item);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    int m_index;
    bool m_isUser;
    QString m_imagePath;
    bool m_isLoaded = false;
    UserTemplateMenu* m_menu = nullptr; // a child of this item
};
