// One thumbnail in the template picker: the picture of a template over a checker, framed when it is chosen.
// The picture is read when the item is first painted.
#pragma once

#include "touchui/TouchEventButton.h"

#include <QString>

class UserTemplateMenu;

class TemplateItem : public TouchEventButton
{
    Q_OBJECT

public:
    static const int WIDGET_WIDTH = 248;
    static const int WIDGET_HEIGHT = 143;

    // index: position in the picker's list of templates.
    TemplateItem(int index, bool isUser, QWidget* parent = nullptr);

    int getIndex() const { return mIndex; }
    void setIndex(int index) { mIndex = index; }
    bool isUser() const { return mIsUser; }

    // Path of a picture of 240 x 135 pixels; larger ones are scaled down. The bare checker shows when there
    // is none, when it cannot be read, and when it is so large that it is no thumbnail.
    void setImage(QString path);
    void setNormalStyle();
    void setSelectedStyle();
    bool hasSelectedStyle() const { return mHasSelectedStyle; }

    // What a tap does: takes the selected style and emits itemSelected.
    void clickTriggered();
    // Opens the option menu beside a user template; does nothing for a preset.
    void showMenu();

Q_SIGNALS:
    void itemSelected(int index, TemplateItem* item);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    int mIndex;
    bool mIsUser;
    bool mHasSelectedStyle = false;
    QString mImagePath;
    bool mIsLoaded = false;
    UserTemplateMenu* mMenu = nullptr; // a child of this item
};
