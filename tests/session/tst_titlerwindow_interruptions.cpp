// Every touch widget of the program, interrupted in every way while a finger works it: the window with its
// list, canvas and panel, move mode, and each of its dialogs.
#include "app/EditContextController.h"
#include "app/TitlerWindow.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "canvas/GraphicsView.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "panel/ColorPalette.h"
#include "panel/TextToolsPanel.h"
#include "tests/app/Siblings.h"
#include "tests/gallery/Interruptions.h"
#include "tests/library/TemplateFixture.h"
#include "tests/support/Patience.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSMenu.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

#include <QAbstractButton>
#include <QApplication>
#include <QTest>

using Prepare = std::function<void()>;
using Concerns = std::function<bool(const QWidget*)>;

class tst_titlerwindow_interruptions : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void everyWidget_data();
    void everyWidget();
    void everyClassIsThere();

private:
    void closeDialogs();
    void selectText();

    ManualClock m_clock; // before all widgets
    TemplateFixture m_fixture;
    Siblings m_siblings;
    TitlerWindow* m_window = nullptr;
    QStringList m_names;
};

void tst_titlerwindow_interruptions::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    m_fixture.resetTemplates();
    m_fixture.makePresets("templates_en", {"lower", "strap", "corner", "full", "news"});
    m_fixture.makeUserTemplates(2);
    for (const char* name : {"news", "sports", "weather"})
        LibraryFixture::fillFolder(m_fixture.makeFolder(QLatin1String(name)), {"t1", "t2", "t3"});
    const QString folder = m_fixture.makeFolder(QStringLiteral("open"));
    QStringList stems;
    for (int i = 10; i < 22; ++i)
        stems.append(QStringLiteral("t%1").arg(i));
    LibraryFixture::fillFolder(folder, stems);
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    m_window = new TitlerWindow(true, nullptr);
    pMainWindow = m_window;
    m_window->setRealClose(false);
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, folder.toStdWString()});
    QVERIFY(QTest::qWaitForWindowExposed(m_window, PATIENCE_MS));
    const auto* list = m_window->findChild<ArchiveList*>();
    QTRY_COMPARE(list->count(), 12);
    QTRY_VERIFY(list->archiveItem(11)->hasChildWidgets());
    // A tap is seen, but opens no dialog and closes no window.
    for (QAbstractButton* button : m_window->findChildren<QAbstractButton*>())
        if (!qobject_cast<KSBaseItemWidget*>(button))
            disconnect(button, &QAbstractButton::clicked, nullptr, nullptr);
}

void tst_titlerwindow_interruptions::cleanupTestCase()
{
    closeDialogs();
    m_window->closeTitlerWindow();
    delete m_window;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow_interruptions::closeDialogs()
{
    m_window->findChild<FolderPicker*>()->hide(); // closing it would end the session
    m_window->findChild<TemplatePicker*>()->hide();
    for (QWidget* window : QApplication::topLevelWidgets())
        if (window != m_window && window->isVisible())
            window->close();
    QCoreApplication::processEvents();
}

// As after a tap on it: the panel works on it then.
void tst_titlerwindow_interruptions::selectText()
{
    auto* scene = m_window->findChild<CanvasScene*>();
    scene->clearItemsSelectionAndFocus();
    if (scene->getTextItemList().isEmpty())
        QMetaObject::invokeMethod(m_window->findChild<ToolsBar*>(), "newTextButtonClick");
    auto* view = m_window->findChild<GraphicsView*>();
    GraphicsText* text = nullptr;
    for (QGraphicsItem* item : scene->items()) {
        auto* candidate = qgraphicsitem_cast<GraphicsText*>(item);
        if (candidate && !candidate->isParentObject())
            text = candidate;
    }
    QVERIFY(text);
    view->mouseClick();
    const QPoint place = view->mapFromScene(text->mapToScene(text->layoutRect().center()));
    QTest::mouseClick(view->viewport(), Qt::LeftButton, {}, place);
    view->mouseClick();
}

void tst_titlerwindow_interruptions::everyWidget_data()
{
    QTest::addColumn<Concerns>("concerns");
    QTest::addColumn<Prepare>("prepare");
    const Concerns dialogs = [this](const QWidget* widget) { return widget->window() != m_window; };
    QTest::newRow("the window") << Concerns([this](const QWidget* widget) {
        return widget->window() == m_window;
    }) << Prepare([this] { selectText(); });
    QTest::newRow("move mode") << Concerns([this](const QWidget* widget) {
        return m_window->findChild<ArchiveList*>()->isAncestorOf(widget);
    }) << Prepare([this] {
        if (!m_window->archiveListIsMoveMode())
            m_window->editAndDoneButtonClicked();
    });
    QTest::newRow("the folder picker") << dialogs << Prepare([this] {
        auto* picker = m_window->findChild<FolderPicker*>();
        picker->updateTreeView();
        picker->show();
        picker->treeView()->setCurrentIndex(picker->treeModel()->index(0, 0));
    });
    QTest::newRow("the editor of a folder's name") << dialogs << Prepare([this] {
        auto* picker = m_window->findChild<FolderPicker*>();
        picker->updateTreeView();
        picker->show();
        picker->startEditing(picker->treeModel()->index(0, 0));
        QVERIFY(picker->editor());
    });
    QTest::newRow("the template picker")
        << dialogs << Prepare([this] { m_window->findChild<TemplatePicker*>()->show(); });
    QTest::newRow("the palette") << dialogs << Prepare([this] {
        selectText();
        m_window->findChild<ColorPalette*>()->show();
    });
    QTest::newRow("the option menu") << dialogs << Prepare([this] {
        auto* list = m_window->findChild<ArchiveList*>();
        list->itemRightPressedEvent(list->archiveItem(0), QPoint(60, 60), list);
    });
}

void tst_titlerwindow_interruptions::everyWidget()
{
    QFETCH(Concerns, concerns);
    QFETCH(Prepare, prepare);
    Interruptions touches(m_clock);
    touches.concerns = concerns;
    touches.restore = [this, prepare] {
        closeDialogs();
        if (m_window->archiveListIsMoveMode())
            m_window->slotCancelArchiveListMoveMode();
        m_window->show();
        m_window->findChild<ArchiveList*>()->moveToWidgetItem(0);
        prepare();
        QCoreApplication::processEvents();
        m_clock.advance(5000);
    };
    QStringList result;
    const QStringList kinds = touches.kinds();
    for (const QString& name : kinds) {
        if (m_names.contains(name))
            continue;
        for (const QString& problem : touches.problems(name))
            result.append(name + QStringLiteral(" after ") + problem);
    }
    m_names += kinds;
    QVERIFY2(result.isEmpty(), qPrintable(QLatin1Char('\n') + result.join(QLatin1Char('\n'))));
}

// The walk finds what there is to be found.
void tst_titlerwindow_interruptions::everyClassIsThere()
{
    const QString names = m_names.join(QLatin1Char('\n'));
    for (const char* part : {"ArchiveItem", "movable", "GraphicsView", "ToolsBar", "TextToolsPanel",
                             "KSTreeView", "KSTreeHeaderView", "FolderEditor", "TemplateItem", "KSTabBar",
                             "ColorPalette", "ColorButton", "ArchiveMenu", "FontCombox", "KSRadiobutton"})
        QVERIFY2(names.contains(QLatin1String(part)), qPrintable(QLatin1String(part) + "\n" + names));
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName(QStringLiteral("Titler"));
    application.setQuitOnLastWindowClosed(false);
    tst_titlerwindow_interruptions test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_titlerwindow_interruptions.moc"
