#pragma once

#include "CanvasFingers.h"
#include "HandClock.h"
#include "OtherProcesses.h"
#include "SoftKeyboardStandIn.h"
#include "app/EditContextController.h"
#include "app/ShowTitlerController.h"
#include "app/ToolsBar.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplateItem.h"
#include "library/TemplatePicker.h"
#include "panel/TextColorToolBox.h"
#include "panel/TextToolsPanel.h"
#include "touchui/KSMenu.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

#include <QAbstractButton>
#include <QAbstractScrollArea>
#include <QLineEdit>
#include <QPushButton>
#include <QTabBar>

// Random fingers in the window and in everything that it opens, with input of the soft keyboard and requests
// of other processes between touches.
class WindowFingers : public CanvasFingers
{
public:
    WindowFingers(TitlerWindow& window, QPointingDevice* device, quint32 seed, SoftKeyboardStandIn& keyboard,
                  OtherProcesses& others, const QString& titleRoot, Counts& counts)
        : CanvasFingers(window, device, seed)
        , m_keyboard(keyboard)
        , m_others(others)
        , m_root(titleRoot)
        , m_counts(counts)
        , m_list(*window.findChild<ArchiveList*>())
        , m_folders(*window.findChild<FolderPicker*>())
        , m_templates(*window.findChild<TemplatePicker*>())
        , m_bar(*window.findChild<ToolsBar*>())
        , m_panel(*window.findChild<TextToolsPanel*>())
    {
    }

    // Sends one touch event, or lets time pass while a finger rests.
    void step()
    {
        if (!isTouching()) {
            m_rest = 0;
            m_isTap = false;
        } else if (const int rest = std::exchange(m_rest, 0)) {
            m_clock.pass(rest);
            return;
        } else if (std::exchange(m_isTap, false)) {
            releaseOne();
            return;
        } else if (below(12) == 0) {
            m_clock.pass(below(3) == 0 ? HOLD : MOMENT);
        }
        act();
    }

    // Lifts all fingers and prevents further presses, even of a finger that waits for a dialog to close.
    void end()
    {
        m_isOver = true;
        liftAll();
    }

protected:
    void betweenTouches() override
    {
        if (m_isOver)
            return;
        m_others.serveMessages();
        m_keyboard.settle();
        if (m_window.isHidden()) {
            if (below(3) == 0)
                request();
            return;
        }
        if (m_keyboard.isUp() && !m_others.isAsking() && below(4) == 0)
            useKeyboard();
        const int kind = below(200);
        if (kind < 10)
            m_others.act(m_list.getCurrentPath());
        else if (kind < 60)
            m_clock.pass(below(4) == 0 ? LONG : MOMENT);
        else if (kind < 66 && !QApplication::activeModalWidget() && !m_others.isAsking())
            undoOrRedo();
        else if (kind < 68 && !QApplication::activeModalWidget())
            type(); // as on a physical keyboard
    }

    Aim aim() override
    {
        QApplication::setDoubleClickInterval(below(2) == 0 ? 0 : LONG);
        if (m_window.isHidden() || m_isOver)
            return {};
        const QWidgetList windows = windowsBeside(&m_window);
        QWidget* dialog = QApplication::activeModalWidget();
        QWidgetList popups = windows;
        popups.removeAll(&m_folders);
        popups.removeAll(&m_templates);
        QWidget* window = dialog ? dialog : &m_window;
        if (!popups.isEmpty() && below(10) < 7)
            window = anyOf(popups);
        else if (below(30) == 0)
            window = &m_window;
        const QPoint point = pointOf(window);
        return {window, point};
    }

    QPoint pointOf(QWidget* window) override
    {
        if (!isTouching())
            m_isTap = below(3) != 0;
        if (below(25) == 0)
            return within(window->rect());
        if (window == &m_folders)
            return pointOnFolders();
        if (window == &m_templates)
            return pointOnTemplates();
        if (const auto* menu = qobject_cast<KSMenu*>(window))
            return pointOnMenu(*menu);
        if (window != &m_window)
            return pointOnAny<QAbstractButton>(window, window);
        return pointOnWindow();
    }

private:
    // Milliseconds: shorter than all timers that wait for the operator; long enough for a long press; longer
    // than all timers.
    static constexpr int MOMENT = 60;
    static constexpr int HOLD = 800;
    static constexpr int LONG = 2500;

    template <class Widget>
    QPoint pointOnAny(QWidget* parent, QWidget* window)
    {
        QList<Widget*> widgets = parent->findChildren<Widget*>();
        erase_if(widgets, [window](const QWidget* widget) {
            return !widget->isVisible() || !widget->isEnabled() || widget->window() != window ||
                   widget->visibleRegion().isEmpty();
        });
        if (widgets.isEmpty())
            return within(window->rect());
        return pointOn(anyOf(widgets));
    }
    QPoint pointOn(const QWidget* widget)
    {
        return widget->mapTo(widget->window(), within(widget->visibleRegion().boundingRect()));
    }

    QPoint pointOnWindow()
    {
        const int kind = below(100);
        if (m_window.archiveListIsMoveMode() && kind < 90)
            return kind < 85 ? pointOnList() : pointOnMoveButton();
        if (kind < 22) {
            m_isTap = m_isTap && below(2) == 0;
            return pointOnCanvas();
        }
        // The panel is enabled only for a text.
        if (kind < 40 && (m_scene.itemIsEditorInteraction() || m_scene.itemIsSelectionMode()))
            return pointOnPanel(kind - 22);
        if (kind < 64)
            return pointOnList();
        if (kind < 70)
            return pointOnMoveButton();
        if (kind < 80)
            return pointOnAny<QAbstractButton>(&m_window, &m_window);
        return pointOnAny<QPushButton>(&m_bar, &m_window);
    }
    QPoint pointOnPanel(int kind)
    {
        if (kind < 2)
            return pointOnAny<QAbstractButton>(m_panel.findChild<TextColorToolBox*>(), &m_window);
        return kind < 12 ? pointOnAny<QAbstractButton>(&m_panel, &m_window)
                         : within(TitlerWindow::TEXT_PROPERTY_RECT);
    }
    QPoint pointOnMoveButton()
    {
        const auto buttons = m_list.parentWidget()->findChildren<QPushButton*>();
        for (QPushButton* button : buttons)
            if (button->isVisible() &&
                (button->text() == TitlerWindow::tr("Move") || button->text() == TitlerWindow::tr("Done")))
                return pointOn(button);
        return pointOnList();
    }
    QPoint pointOnList()
    {
        QWidget* viewport = m_list.viewport();
        if (m_list.isEmpty() || below(12) == 0) {
            m_rest = below(2) == 0 ? HOLD : 0;
            return viewport->mapTo(&m_window, within(viewport->rect()));
        }
        const int first = qMax(m_list.firstVisibleItem(), 0);
        const int last = qBound(first, m_list.lastVisibleItem(), m_list.count() - 1);
        ArchiveItem* item = m_list.archiveItem(first + below(last - first + 1));
        QRect area = item->visibleRegion().boundingRect();
        if (m_window.archiveListIsMoveMode() && below(4) != 0) {
            area &= item->getDragArea();
            m_rest = MOMENT; // long enough to lift the title
            m_isTap = false;
        } else if (below(3) == 0) {
            m_rest = HOLD; // long enough to open the menu
            m_isTap = true;
        }
        return item->mapTo(&m_window, within(area));
    }

    // Returns a point on a menu row, more often on rows whose actions depend on each other.
    QPoint pointOnMenu(const KSMenu& menu)
    {
        static const QList<int> rows{0, 1, 1, 2, 2, 2, 3, 4};
        return within(menu.getMenuItemRect(anyOf(rows)));
    }
    QPoint pointOnFolders()
    {
        KSTreeView* tree = m_folders.treeView();
        const int rows = m_folders.treeModel()->rowCount();
        const int kind = below(20);
        if (kind < 4)
            return pointOn(m_folders.findChild<QPushButton*>(QStringLiteral("openFolderButton")));
        if (rows == 0 || kind < 9)
            return pointOnAny<QPushButton>(&m_folders, &m_folders);
        QModelIndex index = m_folders.treeModel()->index(below(rows), 0);
        if (const int children = m_folders.treeModel()->rowCount(index); children > 0 && below(4) == 0)
            index = m_folders.treeModel()->index(below(children), 0, index);
        const QRect row = tree->visualRect(index).intersected(tree->viewport()->rect());
        if (row.isEmpty())
            return tree->viewport()->mapTo(&m_folders, within(tree->viewport()->rect()));
        if (below(3) == 0)
            m_rest = HOLD; // long enough to start renaming the folder
        return tree->viewport()->mapTo(&m_folders, within(row));
    }
    QPoint pointOnTemplates()
    {
        const int kind = below(10);
        if (kind < 4)
            return pointOnAny<TemplateItem>(&m_templates, &m_templates);
        if (kind < 5)
            return pointOnAny<QTabBar>(&m_templates, &m_templates);
        return pointOnAny<QPushButton>(&m_templates, &m_templates);
    }

    void count(const char* what)
    {
        ++m_counts[QLatin1String(what)];
        note(QLatin1String(what));
    }

    void useKeyboard()
    {
        static const QStringList pieces{QStringLiteral("abc"),         QString::fromUtf8("快讯"),
                                        QString::fromUtf8("速報です"), QString::fromUtf8("속보"),
                                        QString::fromUtf8("😀"),        QStringLiteral("\n")};
        static const QList<int> keys{Qt::Key_Backspace, Qt::Key_Left, Qt::Key_Right, Qt::Key_Delete,
                                     Qt::Key_Escape};
        const int kind = below(10);
        if (kind == 0) {
            count("keyboards put away");
            m_keyboard.putAway();
        } else if (kind == 1) {
            m_keyboard.press(anyOf(keys));
        } else if (kind == 2) {
            m_keyboard.select(below(5), below(8), below(3));
        } else if (!m_keyboard.isForLine()) {
            count("texts typed on the keyboard");
            m_keyboard.type(anyOf(pieces));
        } else {
            count("lines typed on the keyboard");
            m_keyboard.typeLine(below(4) == 0 ? QString::number(below(1200)) : m_others.anyName());
        }
    }

    // Returns a folder, often that with the most titles, so that its limit is reached.
    QString anyFolder()
    {
        const QStringList names = m_others.folders();
        if (names.isEmpty())
            return m_root;
        QString folder = m_root + '/' + anyOf(names);
        if (below(3) != 0)
            return folder;
        for (const QString& name : names)
            if (TitleAccount::stemsIn(m_root + '/' + name).size() > TitleAccount::stemsIn(folder).size())
                folder = m_root + '/' + name;
        return folder;
    }

    // Sends a random request to show the window.
    void request()
    {
        auto* context = EditContextController::getInstance();
        const QString folder = anyFolder();
        const QStringList stems = TitleAccount::stemsIn(folder);
        const int kind = below(11);
        if (kind < 3) {
            count("requests to create");
            context->showTitlerCreate(kind);
        } else if (kind < 5) {
            count("requests to edit a folder");
            context->showTitlerEdit({kind, folder.toStdWString()});
        } else if (kind < 7 && !stems.isEmpty()) {
            count("requests to edit a title");
            const QString stem = stems.at(below(int(stems.size())));
            context->showTitlerEdit({kind, (folder + '/' + stem + ".xml").toStdWString()});
        } else if (kind < 9) {
            count("requests without a path");
            context->showTitlerEdit({kind, {}});
        } else if (kind < 10) {
            count("requests for what is not there");
            context->showTitlerEdit({kind, (folder + "/gone.xml").toStdWString()});
        } else {
            count("requests of the sub panel");
            ShowTitlerController::getInstance()->showTitler();
        }
    }

    HandClock m_clock;
    SoftKeyboardStandIn& m_keyboard;
    OtherProcesses& m_others;
    QString m_root;
    Counts& m_counts;
    ArchiveList& m_list;
    FolderPicker& m_folders;
    TemplatePicker& m_templates;
    ToolsBar& m_bar;
    TextToolsPanel& m_panel;
    bool m_isOver = false;
    int m_rest = 0;       // milliseconds that the finger rests before its next event
    bool m_isTap = false; // whether the next event is a release
};
