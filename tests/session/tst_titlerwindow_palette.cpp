// A colour that is only previewed, whatever happens while the palette is open: every character gets its own
// colour back, and neither the file, the style for the next run nor a new text learns of the preview.
#include "app/APPEventFilter.h"
#include "app/TitlerWindow.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "canvas/GraphicsView.h"
#include "document/FontStyle.h"
#include "document/SettingManager.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "panel/ColorButton.h"
#include "panel/ColorPalette.h"
#include "panel/EdgeSizeSlider.h"
#include "panel/TextToolsPanel.h"
#include "tests/app/Siblings.h"
#include "tests/library/LibraryFixture.h"
#include "tests/support/Patience.h"
#include "tests/touchui/TouchDevice.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSSLider.h"
#include "touchui/KSSoftKeyboardCursorSettingEvent.h"

#include <QAction>
#include <QApplication>
#include <QInputMethodEvent>
#include <QMetaEnum>
#include <QPushButton>
#include <QTest>
#include <QTextCursor>

namespace
{

constexpr int GREEN_BUTTON = 14;
const char GREEN[] = "#00C743";
constexpr int BLUE_BUTTON = 16;
const char* const COLORS[] = {"#C80000", "#0D5EFF", "#FFF700", "#FFFFFF"};
const char* const EDGE_COLORS[] = {"#393939", "#000000", "#9410E6", "#C6C6C6"};
constexpr QPoint EMPTY_PLACE(1200, 680); // on the canvas

} // namespace

class tst_titlerwindow_palette : public QObject
{
    Q_OBJECT

public:
    enum Event {
        Cancel,
        ColorButtonAgain,
        EmptyCanvasTapped,
        OtherTextTapped,
        SameTextTapped,
        OtherTitleTapped,
        NewText,
        DeletedAndBack,
        Undo,
        Typed,
        KeyboardSelects,
        KeyboardClosed,
        Bold,
        EdgeWidth,
        Saved,
        MoveMode,
        Hidden,
        Close,
        PowerOff
    };
    Q_ENUM(Event)

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void previewLeavesNothing_data();
    void previewLeavesNothing();
    void sliderIsCommittedFirst();

private:
    static TText* makeText(const QString& text, int id, float x, float y);
    void openPalette(const QString& button, bool wholeTextInEditing);
    void happen(Event event, const QString& button);
    void tap(const QPoint& scenePlace);
    void doubleTap(const QPoint& scenePlace);
    void finger(QEventPoint::State state, const QWidget* widget, const QPoint& place);
    QPoint centerOf(int id) const;
    // "color edge-colour" of every character, by object.
    static QStringList colorsOf(const TText& text);
    QStringList colorsOnCanvas() const;
    QStringList colorsOnDisk() const;

    template <typename Widget>
    Widget* find(const QString& name = QString()) const
    {
        return m_window->findChild<Widget*>(name);
    }
    CanvasScene* scene() const { return find<CanvasScene>(); }
    ColorPalette* palette() const { return find<ColorPalette>(); }
    QAction* undoAction() const;

    LibraryFixture m_fixture;
    Siblings m_siblings;
    TouchDevice m_device;
    std::unique_ptr<TitlerWindow> m_window;
    QString m_folder;
};

void tst_titlerwindow_palette::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
}

TText* tst_titlerwindow_palette::makeText(const QString& text, int id, float x, float y)
{
    TText* record = LibraryFixture::makeText(text, id, x, y);
    int i = 0;
    for (TextStyle* style : record->textItems()) {
        TEdge edge;
        edge.setEdgeWidth(2 + i);
        edge.setEdgeColor(EDGE_COLORS[i % 4]);
        style->setFontFamily("KST");
        style->setFontColor(COLORS[(i++ + id) % 4]);
        style->setFontSize(96);
        style->setIsTextEdge(1);
        style->setTextEdge(edge);
    }
    return record;
}

void tst_titlerwindow_palette::init()
{
    APPEventFilter::instance();
    m_window = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = m_window.get();
    m_window->setRealClose(false);
    m_folder = m_fixture.makeFolder(QStringLiteral("palette"));
    const auto archive = LibraryFixture::makeRecord(m_folder, QStringLiteral("a"), QString());
    archive->setText(
        {makeText(QStringLiteral("AAAA"), 1, 100, 100), makeText(QStringLiteral("BBBB"), 2, 600, 400)});
    LibraryFixture::fillFolder(m_folder, {QStringLiteral("b")});
    ArchiveController().saveNewArchive(m_folder, archive.get());
    LibraryFixture::writeOrder(m_folder, {QStringLiteral("a"), QStringLiteral("b")});

    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, m_folder.toStdWString()});
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), PATIENCE_MS));
    QTRY_VERIFY(find<ArchiveList>()->archiveItem(1) &&
                find<ArchiveList>()->archiveItem(1)->hasChildWidgets());
    QCOMPARE(scene()->getTextItemList().size(), 2);
}

void tst_titlerwindow_palette::cleanup()
{
    if (m_window && m_window->isVisible())
        m_window->endProcess();
    m_window.reset();
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow_palette::finger(QEventPoint::State state, const QWidget* widget, const QPoint& place)
{
    const QPoint point = widget->mapTo(m_window.get(), place);
    auto touch = QTest::touchEvent(m_window.get(), m_device);
    if (state == QEventPoint::Pressed)
        touch.press(0, point);
    else
        touch.release(0, point);
}

void tst_titlerwindow_palette::doubleTap(const QPoint& scenePlace)
{
    const auto* view = find<GraphicsView>();
    m_device.tap(m_window.get(), view->mapTo(m_window.get(), view->mapFromScene(scenePlace)), 2);
}

void tst_titlerwindow_palette::tap(const QPoint& scenePlace)
{
    auto* view = find<GraphicsView>();
    view->mouseClick(); // no double tap
    m_device.tap(m_window.get(), view->mapTo(m_window.get(), view->mapFromScene(scenePlace)));
    view->mouseClick();
}

QPoint tst_titlerwindow_palette::centerOf(int id) const
{
    return scene()->findTextItem(id)->sceneBoundingRect().center().toPoint();
}

QAction* tst_titlerwindow_palette::undoAction() const
{
    for (QAction* action : m_window->findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly))
        if (action->text().startsWith(QLatin1String("Undo")))
            return action;
    return nullptr;
}

QStringList tst_titlerwindow_palette::colorsOf(const TText& text)
{
    QStringList colors;
    for (const TextStyle* style : text.textItems()) {
        colors.append(QStringLiteral("%1: %2 %3")
                          .arg(text.getTextObjectID())
                          .arg(QString::fromStdString(style->getFontColor()),
                               QString::fromStdString(style->textEdge().getEdgeColor())));
    }
    return colors;
}

QStringList tst_titlerwindow_palette::colorsOnCanvas() const
{
    QStringList colors;
    for (const int id : {1, 2})
        if (const GraphicsText* item = scene()->findTextItem(id))
            colors += colorsOf(*item->getItemTText());
    return colors;
}

QStringList tst_titlerwindow_palette::colorsOnDisk() const
{
    Archive archive;
    QStringList colors;
    if (!ArchiveController().getOneArchive(m_folder + "/a.xml", &archive))
        return {QStringLiteral("unreadable")};
    for (const int id : {1, 2}) {
        for (const TText* text : archive.text())
            if (text->getTextObjectID() == id)
                colors += colorsOf(*text);
    }
    return colors;
}

void tst_titlerwindow_palette::openPalette(const QString& button, bool wholeTextInEditing)
{
    if (wholeTextInEditing) {
        doubleTap(centerOf(1));
        QCOMPARE(scene()->findTextItem(1)->getStatusId(), 1);
    } else {
        tap(centerOf(1));
        QCOMPARE(scene()->findTextItem(1)->getStatusId(), 0);
    }
    find<QAbstractButton>(button)->click();
    QTRY_VERIFY(palette()->isVisible());
}

void tst_titlerwindow_palette::happen(Event event, const QString& button)
{
    GraphicsText* item = scene()->findTextItem(1);
    switch (event) {
    case Cancel:
        find<QAbstractButton>("PaletteCancel")->click();
        break;
    case ColorButtonAgain:
        find<QAbstractButton>(button)->click();
        QVERIFY(palette()->isVisible());
        find<QAbstractButton>("PaletteCancel")->click();
        break;
    case EmptyCanvasTapped:
        tap(EMPTY_PLACE);
        break;
    case OtherTextTapped:
        tap(centerOf(2));
        QCOMPARE(scene()->findTextItem(2)->getStatusId(), 0);
        break;
    case SameTextTapped:
        tap(centerOf(1));
        QCOMPARE(item->getStatusId(), 2);
        break;
    case OtherTitleTapped:
        for (const auto state : {QEventPoint::Pressed, QEventPoint::Released})
            finger(state, find<ArchiveList>(), QPoint(150, 143 + 60));
        QCOMPARE(find<ArchiveList>()->getItemIndex(find<ArchiveList>()->getSelectedArchive()), 1);
        break;
    case NewText: {
        m_window->slotNewTextButtonClicked();
        const GraphicsText* text = scene()->findTextItem(3);
        QVERIFY(text);
        const TextStyle& style = *text->getLastAlpaTextStyleValue()->textItems().front();
        QVERIFY(style.getFontColor() != GREEN);
        QVERIFY(style.textEdge().getEdgeColor() != GREEN);
        break;
    }
    case DeletedAndBack:
        m_window->pressDelectButton();
        QVERIFY(!scene()->findTextItem(1));
        undoAction()->trigger();
        QVERIFY(scene()->findTextItem(1));
        break;
    case Undo:
        m_window->hideSoftWareWithOutDeleteEmptyItems(); // as the button does first
        undoAction()->trigger();
        break;
    case Typed: {
        item->setTextInteractionFlags(Qt::TextEditorInteraction);
        QTextCursor cursor = item->textCursor();
        cursor.setPosition(4);
        item->setTextCursor(cursor);
        scene()->setFocusItem(item);
        QInputMethodEvent commit;
        commit.setCommitString(QStringLiteral("x"));
        QCoreApplication::sendEvent(scene(), &commit);
        QCOMPARE(item->toPlainText(), QStringLiteral("AAAAx"));
        QVERIFY(!colorsOnCanvas().join('\n').contains(GREEN));
        cursor.deletePreviousChar();
        item->pushLastEditTextIntoStack();
        break;
    }
    case KeyboardSelects: {
        KSSoftKeyboardCursorSettingEvent select(0, 1, 1, 1);
        QCoreApplication::sendEvent(item, &select);
        QCOMPARE(item->textCursor().selectedText(), QStringLiteral("A"));
        break;
    }
    case KeyboardClosed: {
        QEvent closed(QEvent::Type(KSInputContext::SoftKeyBoardCloseType));
        QCoreApplication::sendEvent(item, &closed);
        break;
    }
    case Bold:
        find<QAbstractButton>("Icon_Bold")->click();
        QVERIFY(item->getItemTText()->textItems().front()->isFontBold());
        QVERIFY(undoAction()->isEnabled());
        break;
    case EdgeWidth:
        find<QAbstractButton>("EdgeWidth")->click();
        QTRY_VERIFY(find<EdgeSizeSlider>()->isVisible());
        find<EdgeSizeSlider>()->slider()->setValue(7);
        find<TextToolsPanel>()->hideEdgeSlider();
        break;
    case Saved:
        scene()->saveArchive(); // whatever the reason, the palette stays
        QCOMPARE(colorsOnDisk().filter(GREEN).size(), 0);
        find<QAbstractButton>("PaletteCancel")->click();
        break;
    case MoveMode:
        for (QPushButton* each : m_window->findChildren<QPushButton*>())
            if (each->text() == TitlerWindow::tr("Move"))
                each->click();
        QVERIFY(m_window->archiveListIsMoveMode());
        break;
    case Hidden:
        m_window->hide();
        break;
    case Close:
        m_window->closeTitlerWindow();
        break;
    case PowerOff:
        m_window->slotPowerOff();
        break;
    }
}

void tst_titlerwindow_palette::previewLeavesNothing_data()
{
    QTest::addColumn<Event>("event");
    QTest::addColumn<QString>("button");
    QTest::addColumn<bool>("inEditing");
    const QMetaEnum events = QMetaEnum::fromType<Event>();
    for (int i = 0; i < events.keyCount(); ++i) {
        const auto event = static_cast<Event>(events.value(i));
        for (const char* button : {"TextColor", "EdgeColor"}) {
            for (const bool inEditing : {false, true}) {
                if (inEditing && event == SameTextTapped) // the caret goes there, nothing more
                    continue;
                QTest::addRow("%s, %s, %s", events.key(i), button, inEditing ? "in editing" : "as an object")
                    << event << button << inEditing;
            }
        }
    }
}

void tst_titlerwindow_palette::previewLeavesNothing()
{
    QFETCH(Event, event);
    QFETCH(QString, button);
    QFETCH(bool, inEditing);
    const QStringList before = colorsOnCanvas();
    QCOMPARE(before.size(), 8);
    QCOMPARE(colorsOnDisk(), before);
    openPalette(button, inEditing);
    if (QTest::currentTestFailed())
        return;
    const QList<ColorButton*> buttons = palette()->findChildren<ColorButton*>();
    buttons.at(BLUE_BUTTON)->click();
    buttons.at(GREEN_BUTTON)->click();
    QCOMPARE(colorsOnCanvas().filter(GREEN).size(), 4);

    happen(event, button);
    if (QTest::currentTestFailed())
        return;
    QVERIFY(!palette()->isVisible());
    if (m_window->isVisible() && event != OtherTitleTapped)
        QCOMPARE(colorsOnCanvas(), before);
    if (m_window->isVisible()) {
        palette()->reject(); // one that comes late has nothing to give back
        m_window->closeTitlerWindow();
    }
    QCOMPARE(colorsOnDisk(), before);
    FontStyle last;
    SettingManager().loadLastTextParameter(&last);
    QVERIFY(last.getColor() != GREEN);
    QVERIFY(last.getEdgePoint()->getEdgeColor() != GREEN);
}

// The width that the slider shows is kept, whatever closes the slider.
void tst_titlerwindow_palette::sliderIsCommittedFirst()
{
    tap(centerOf(1));
    find<QAbstractButton>("EdgeWidth")->click();
    QTRY_VERIFY(find<EdgeSizeSlider>()->isVisible());
    find<EdgeSizeSlider>()->slider()->setValue(9);
    m_window->slotPowerOff();
    Archive archive;
    QVERIFY(ArchiveController().getOneArchive(m_folder + "/a.xml", &archive));
    for (const TText* text : archive.text()) {
        for (const TextStyle* style : text->textItems())
            if (text->getTextObjectID() == 1)
                QCOMPARE(style->textEdge().getEdgeWidth(), 9);
    }
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName("Titler");
    QApplication::setQuitOnLastWindowClosed(false);
    tst_titlerwindow_palette test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_titlerwindow_palette.moc"
