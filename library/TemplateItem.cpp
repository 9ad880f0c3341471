#include "library/TemplateItem.h"

#include "library/TemplateThumbnail.h"
#include "library/UserTemplateMenu.h"

#include <QIcon>
#include <QPixmap>

TemplateItem::TemplateItem(int index, bool isUser, QWidget* parent)
    : TouchEventButton(parent), mIndex(index), mIsUser(isUser)
{
    setFixedSize(WIDGET_WIDTH, WIDGET_HEIGHT);
    setIconSize(TemplateThumbnail::SIZE);
    setNormalStyle();
    connect(this, &QAbstractButton::clicked, this, &TemplateItem::clickTriggered);
}

void TemplateItem::setImage(QString path)
{
    mImagePath = std::move(path);
    mIsLoaded = false;
    update();
}

void TemplateItem::setNormalStyle()
{
    setStyleSheet(QStringLiteral("QPushButton {border:0; background:url(:/checker) no-repeat center;}"));
}

void TemplateItem::setSelectedStyle()
{
    setStyleSheet(QStringLiteral("QPushButton { border: 4px solid rgb(0, 129, 255); "
                                 "background:url(:/checker) no-repeat center;};"));
}

void TemplateItem::clickTriggered()
{
    setSelectedStyle();
    Q_EMIT itemSelected(mIndex, this);
}

void TemplateItem::showMenu()
{
    if (!mIsUser)
        return;
    if (!mMenu)
        mMenu = new UserTemplateMenu(this);
    mMenu->popup(mapToGlobal(rect().center()));
}

void TemplateItem::paintEvent(QPaintEvent* event)
{
    if (!mIsLoaded) {
        mIsLoaded = true;
        // The checker pattern is drawn into the picture, so that it has the picture's size, not that of the
        // item.
        setIcon(QPixmap::fromImage(TemplateThumbnail::onChecker(TemplateThumbnail::read(mImagePath))));
    }
    TouchEventButton::paintEvent(event);
}
