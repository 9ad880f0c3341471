#include "library/TemplateItem.h"

#include "library/TemplateThumbnail.h"
#include "library/UserTemplateMenu.h"

#include <QIcon>
#include <QPixmap>

TemplateItem::TemplateItem(int index, bool isUser, QWidget* parent)
    : TouchEventButton(parent), m_index(index), m_isUser(isUser)
{
    setFixedSize(WIDGET_WIDTH, WIDGET_HEIGHT);
    setIconSize(TemplateThumbnail::SIZE);
    setNormalStyle();
    connect(this, &QAbstractButton::clicked, this, &TemplateItem::clickTriggered);
}

void TemplateItem::setImage(QString path)
{
    m_imagePath = std::move(path);
    m_isLoaded = false;
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
    Q_EMIT itemSelected(m_index, this);
}

void TemplateItem::showMenu()
{
    if (!m_isUser)
        return;
    if (!m_menu)
        m_menu = new UserTemplateMenu(this);
    m_menu->popup(mapToGlobal(rect().center()));
}

void TemplateItem::paintEvent(QPaintEvent* event)
{
    if (!m_isLoaded) {
        m_isLoaded = true;
        // The checker pattern is drawn into the picture, so that it has the picture's size, not that of the
        // item.
        setIcon(QPixmap::fromImage(TemplateThumbnail::onChecker(TemplateThumbnail::read(m_imagePath))));
    }
    TouchEventButton::paintEvent(event);
}
