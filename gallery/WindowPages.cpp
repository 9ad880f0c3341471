// Pages of larger parts: tabs and the tools bar.
#include "gallery/GalleryPages.h"

#include "app/ToolsBar.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSTabBar.h"
#include "touchui/KSTabWidget.h"

#include <QAction>
#include <QIcon>
#include <QLabel>
#include <QMenu>

namespace
{

KSTabWidget* tabWidget(const GalleryPage& page, const QRect& place, QTabWidget::TabPosition position)
{
    auto* tabs = new KSTabWidget(page.window.get());
    tabs->setTabPosition(position);
    for (const char* name : {"Preset", "User", "Off"}) {
        auto* content = new QLabel(QStringLiteral("Page of %1").arg(QLatin1String(name)));
        content->setAlignment(Qt::AlignCenter);
        content->setStyleSheet(QStringLiteral("color: rgb(220, 220, 220); font-size: 24px;"));
        tabs->addTab(content, QLatin1String(name));
    }
    tabs->setTabEnabled(2, false);
    tabs->setGeometry(place);
    return tabs;
}

ToolsBar* bar(const GalleryPage& page, int y)
{
    auto* undo = new QAction(page.window.get());
    auto* redo = new QAction(page.window.get());
    auto* tools = new ToolsBar(undo, redo, page.window.get());
    tools->setGeometry(0, y, 1363, 67);
    return tools;
}

} // namespace

GalleryPage GalleryPages::tabs()
{
    GalleryPage page(QStringLiteral("tabs"), QSize(1280, 720));
    KSTabWidget* north = tabWidget(page, QRect(20, 20, 600, 300), QTabWidget::North);
    KSTabWidget* south = tabWidget(page, QRect(660, 20, 600, 300), QTabWidget::South);
    KSTabWidget* west = tabWidget(page, QRect(20, 330, 600, 380), QTabWidget::West);
    KSTabWidget* east = tabWidget(page, QRect(660, 330, 600, 380), QTabWidget::East);
    south->setTabIcon(0, QIcon(QStringLiteral(":/FolderPicker/Titler_folder_icon")));
    north->ksTabBar()->setTabSizeHint(1, QSize(220, 52));
    page.pose = [north, west, east](Fingers& fingers) {
        west->setCurrentIndex(1);
        east->setCurrentIndex(1);
        fingers.pressWidget(0, north->ksTabBar(), north->ksTabBar()->tabRect(1).center());
    };
    return page;
}

GalleryPage GalleryPages::toolsBar()
{
    GalleryPage page(QStringLiteral("toolsbar"), QSize(1400, 420));
    ToolsBar* full = bar(page, 10);
    full->changeBtnStatus(true);
    ToolsBar* empty = bar(page, 330);
    empty->resetToDefaultState();
    empty->slotDisableNewTextButton(true);
    page.pose = [full](Fingers& fingers) {
        // The bar draws its menu in its event filter. The application's filter, which normally calls it, does
        // not exist during a pose.
        full->findChild<QMenu*>()->installEventFilter(full);
        full->findChild<KSPushbutton*>(QStringLiteral("SafeArea"))->click();
        fingers.pressWidget(0, full->findChild<KSPushbutton*>(QStringLiteral("Folder")), QPoint(60, 30));
        full->findChild<KSPushbutton*>(QStringLiteral("Canvas"))->click();
    };
    return page;
}
