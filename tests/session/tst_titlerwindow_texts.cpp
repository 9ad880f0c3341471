// The texts of a title on all the ways that an operator goes away from them: nothing blank is saved, an
// emptied title is, the soft keyboard is put away; and what a new text looks like.
#include "app/APPEventFilter.h"
#include "app/EditContextController.h"
#include "app/TitlerPowerController.h"
#include "app/TitlerWindow.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "canvas/GraphicsView.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "panel/ColorButton.h"
#include "panel/ColorPalette.h"
#include "panel/TextToolsPanel.h"
#include "tests/app/Siblings.h"
#include "tests/fakes/FakeTitlerCallBack.h"
#include "tests/library/LibraryFixture.h"
#include "tests/properties/SoftKeyboardStandIn.h"
#include "tests/support/Patience.h"
#include "tests/touchui/TouchDevice.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"

#include <QAction>
#include <QApplication>
#include <QComboBox>
#include <QMetaEnum>
#include <QTest>
#include <QTextCursor>
#include <QTimer>
#include <QXmlStreamReader>

namespace
{

constexpr int ROW = 143;       // of the list, with the gap
constexpr int PICTURE_X = 150; // in the list
const QPoint EMPTY_PLACE(1200, 680);

// What the panel says about a character.
struct Looks {
    int size = 44;
    std::string family = "DejaVu Sans";
    std::string color = "#C80000";
    int bold = 1;
    int italic = 1;
    int kerning = 120;
    int edge = 1;
    int edgeWidth = 5;
    std::string edgeColor = "#0D5EFF";

    static Looks of(const TextStyle& style)
    {
        return {style.getFontSize(),
                style.getFontFamily(),
                style.getFontColor(),
                style.isFontBold(),
                style.isTextItalic(),
                style.getTextKerning(),
                style.isTextEdge(),
                style.textEdge().getEdgeWidth(),
                style.textEdge().getEdgeColor()};
    }
    void applyTo(TextStyle& style) const
    {
        style.setFontSize(size);
        style.setFontFamily(family);
        style.setFontColor(color);
        style.setFontBold(bold);
        style.setIsTextItalic(italic);
        style.setTextKerning(kerning);
        style.setIsTextEdge(edge);
        TEdge outline;
        outline.setEdgeWidth(edgeWidth);
        outline.setEdgeColor(edgeColor);
        style.setTextEdge(outline);
    }
    QString told() const
    {
        return QStringLiteral("%1 %2 %3 bold %4 italic %5 kerning %6 edge %7 %8 %9")
            .arg(size)
            .arg(QString::fromStdString(family), QString::fromStdString(color))
            .arg(bold)
            .arg(italic)
            .arg(kerning)
            .arg(edge)
            .arg(edgeWidth)
            .arg(QString::fromStdString(edgeColor));
    }
};

} // namespace

class tst_titlerwindow_texts : public QObject
{
    Q_OBJECT

public:
    enum Road {
        OtherTitle,
        ListMenu,
        FolderDialog,
        MoveMode,
        UndoTapped,
        DeleteTapped,
        NewTextAgain,
        Close,
        CloseWithQuestion,
        PowerOff,
        Signal
    };
    Q_ENUM(Road)
    enum Chosen { Selected, LeftAgain, Edited, AfterAnother, SelectedInNewLanguage };
    Q_ENUM(Chosen)

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void blankTextIsNotSaved_data();
    void blankTextIsNotSaved();
    void undoneTextIsNotSavedAtClose();
    void deletedOnlyTextStaysDeleted_data();
    void deletedOnlyTextStaysDeleted();
    void keyboardIsPutAway_data();
    void keyboardIsPutAway();
    void sizeFieldsKeyboardIsPutAway_data();
    void sizeFieldsKeyboardIsPutAway();
    void newTextLooksAsThePanelShows_data();
    void newTextLooksAsThePanelShows();
    void newLanguageShowsItsFamily();
    void previewedColorIsNotTaken();
    void previewedColorIsNotTakenInTheNextSession();

private:
    template <typename Enum>
    static void rowsOf(const char* column)
    {
        QTest::addColumn<Enum>(column);
        const QMetaEnum values = QMetaEnum::fromType<Enum>();
        for (int i = 0; i < values.keyCount(); ++i)
            QTest::newRow(values.key(i)) << Enum(values.value(i));
    }
    void show();
    void take(Road road);
    void tap(const QWidget* widget, const QPoint& place);
    void tapText(int id);
    void tapPanel(const char* name);
    void tapTitle(int row) { tap(list(), QPoint(PICTURE_X, row * ROW + 60)); }
    QAction* action(const QString& name) const;
    Looks looksOfNewText(const QString& typed = QStringLiteral("x"));
    QStringList textsInFile(const QString& stem) const;
    ArchiveList* list() const { return m_window->findChild<ArchiveList*>(); }
    CanvasScene* scene() const { return m_window->findChild<CanvasScene*>(); }
    GraphicsView* view() const { return m_window->findChild<GraphicsView*>(); }
    TextToolsPanel* panel() const { return m_window->findChild<TextToolsPanel*>(); }

    LibraryFixture m_fixture;
    Siblings m_siblings;
    SoftKeyboardStandIn m_keyboard;
    TouchDevice m_device;
    std::unique_ptr<TitlerWindow> m_window;
    QString m_folder;
    Answers m_answers;
};

void tst_titlerwindow_texts::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
}

void tst_titlerwindow_texts::init()
{
    APPEventFilter::instance();
    m_window = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = m_window.get();
    m_window->setRealClose(false);
    KSInputContext::instance()->setKeyBoardController(&m_keyboard);
    m_folder = m_fixture.makeFolder(QStringLiteral("texts"));
    LibraryFixture::fillFolder(m_folder, {"a", "b"});
    const auto styled = LibraryFixture::makeRecord(m_folder, QStringLiteral("styled"), QStringLiteral("MMM"));
    for (TextStyle* style : styled->text().front()->textItems())
        Looks().applyTo(*style);
    auto* other = LibraryFixture::makeText(QStringLiteral("other"), 2, 100, 500);
    other->textItems().front()->setFontSize(96);
    styled->setText({styled->text().front(), other});
    ArchiveController().saveNewArchive(m_folder, styled.get());
    LibraryFixture::writeOrder(m_folder, {"a", "b", "styled"});
    show();
}

void tst_titlerwindow_texts::show()
{
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, m_folder.toStdWString()});
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), PATIENCE_MS));
    QTRY_VERIFY(list()->archiveItem(2) && list()->archiveItem(2)->hasChildWidgets());
    QCOMPARE(QFileInfo(list()->getSelectedArchive()->getArchiveDataPath()).completeBaseName(),
             QStringLiteral("a"));
}

void tst_titlerwindow_texts::cleanup()
{
    EditContextController::getInstance()->resultCallBack(nullptr);
    EditContextController::getInstance()->setITitlerNoCallBack();
    if (m_window->isVisible())
        m_window->closeTitlerMainWindow();
    m_window.reset();
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow_texts::tap(const QWidget* widget, const QPoint& place)
{
    m_device.tap(m_window.get(), widget->mapTo(m_window.get(), place));
    view()->mouseClick(); // no double tap follows
}

void tst_titlerwindow_texts::tapText(int id)
{
    const GraphicsText* item = scene()->findTextItem(id);
    QVERIFY(item);
    tap(view(), view()->mapFromScene(item->sceneBoundingRect().center()));
}

void tst_titlerwindow_texts::tapPanel(const char* name)
{
    const auto* widget = panel()->findChild<QWidget*>(QLatin1String(name));
    QVERIFY(widget && widget->isEnabled());
    tap(widget, widget->rect().center());
}

QAction* tst_titlerwindow_texts::action(const QString& name) const
{
    const auto actions = m_window->findChildren<QAction*>(QString(), Qt::FindDirectChildrenOnly);
    for (QAction* found : actions)
        if (found->text().startsWith(name))
            return found;
    return nullptr;
}

void tst_titlerwindow_texts::take(Road road)
{
    switch (road) {
    case OtherTitle:
        tapTitle(1);
        break;
    case ListMenu: {
        list()->itemRightPressedEvent(list()->archiveItem(0), QPoint(20, 20), list());
        auto* menu = list()->findChild<ArchiveMenu*>();
        list()->selectOptionMenuItem(menu->action(ArchiveAction::ACTION_COPY));
        list()->slotHideOptionMenu();
        break;
    }
    case FolderDialog: {
        auto* dialog = m_window->findChild<FolderPicker*>();
        QTimer::singleShot(0, dialog, [dialog] { dialog->done(QDialog::Rejected); });
        m_window->openFolderDialog();
        break;
    }
    case MoveMode:
        for (KSPushbutton* button : m_window->findChildren<KSPushbutton*>())
            if (button->text() == TitlerWindow::tr("Move"))
                button->click();
        QVERIFY(m_window->archiveListIsMoveMode());
        m_window->slotChangeDoneToMoveMode();
        break;
    case UndoTapped:
        Q_EMIT m_window->findChild<ToolsBar*>()->undoButtonClicked();
        action(QStringLiteral("Undo"))->trigger();
        break;
    case DeleteTapped:
        m_window->pressDelectButton();
        break;
    case NewTextAgain:
        m_window->slotNewTextButtonClicked();
        break;
    case Close:
        m_window->closeTitlerWindow();
        break;
    case CloseWithQuestion:
        EditContextController::getInstance()->resultCallBack(new FakeTitlerCallBack(m_answers));
        EditContextController::getInstance()->insertFilePath(L"new.xml");
        m_window->closeTitlerWindow();
        break;
    case PowerOff:
        TitlerPowerController::getInstance()->powerOff();
        break;
    case Signal:
        m_window->endProcess();
        break;
    }
}

QStringList tst_titlerwindow_texts::textsInFile(const QString& stem) const
{
    QFile file(m_folder + '/' + stem + ".xml");
    if (!file.open(QIODevice::ReadOnly))
        return {QStringLiteral("no file")};
    QStringList texts;
    QXmlStreamReader reader(&file);
    while (!reader.atEnd())
        if (reader.readNext() == QXmlStreamReader::StartElement && reader.name() == QLatin1String("content"))
            texts.append(reader.attributes().value(QLatin1String("text")).toString());
    return texts;
}

void tst_titlerwindow_texts::blankTextIsNotSaved_data()
{
    rowsOf<Road>("road");
}

void tst_titlerwindow_texts::blankTextIsNotSaved()
{
    QFETCH(Road, road);
    m_window->slotNewTextButtonClicked();
    QVERIFY(scene()->findTextItem(2));
    m_keyboard.type(QStringLiteral(" \n "));
    take(road);
    QCOMPARE(textsInFile(QStringLiteral("a")), QStringList{"a"});
    if (m_window->isVisible())
        m_window->closeTitlerWindow();
    QCOMPARE(textsInFile(QStringLiteral("a")), QStringList{"a"});
}

void tst_titlerwindow_texts::undoneTextIsNotSavedAtClose()
{
    m_window->slotNewTextButtonClicked();
    tap(view(), EMPTY_PLACE);
    QVERIFY(!scene()->findTextItem(2));
    take(UndoTapped);
    QVERIFY(scene()->findTextItem(2));
    m_window->closeTitlerWindow();
    QCOMPARE(textsInFile(QStringLiteral("a")), QStringList{"a"});

    // Everything that was typed is taken back.
    show();
    m_window->slotNewTextButtonClicked();
    m_keyboard.type(QStringLiteral("abc"));
    take(UndoTapped);
    QVERIFY(scene()->findTextItem(2) && scene()->findTextItem(2)->isBlank());
    m_window->closeTitlerWindow();
    QCOMPARE(textsInFile(QStringLiteral("a")), QStringList{"a"});
}

void tst_titlerwindow_texts::deletedOnlyTextStaysDeleted_data()
{
    rowsOf<Road>("road");
}

// The title has no background: nothing at all is left of it.
void tst_titlerwindow_texts::deletedOnlyTextStaysDeleted()
{
    QFETCH(Road, road);
    tapText(1);
    m_window->pressDelectButton();
    QVERIFY(scene()->getTextItemList().isEmpty());
    take(road);
    const QStringList wanted = road == UndoTapped ? QStringList{"a"} : QStringList();
    QCOMPARE(textsInFile(QStringLiteral("a")), wanted);
    if (m_window->isVisible())
        m_window->closeTitlerWindow();
    m_window->waitUntilSaved();
    QCOMPARE(textsInFile(QStringLiteral("a")), wanted);
    if (road == UndoTapped)
        return;
    for (const char* picture : {"_1920.png", "_960.png"}) {
        const QImage image = QImage(m_folder + "/a" + picture).convertToFormat(QImage::Format_ARGB32);
        QVERIFY2(!image.isNull(), picture);
        QImage empty(image.size(), image.format());
        empty.fill(Qt::transparent);
        QVERIFY2(image == empty, picture);
    }
    QImage black(240, 135, QImage::Format_RGB32);
    black.fill(Qt::black);
    QCOMPARE(QImage(m_folder + "/a_240S.png").convertToFormat(QImage::Format_RGB32), black);
    QCOMPARE(QImage(m_folder + "/a_240.png").convertToFormat(QImage::Format_RGB32),
             LibraryFixture::checker());
}

void tst_titlerwindow_texts::keyboardIsPutAway_data()
{
    rowsOf<Road>("road");
}

void tst_titlerwindow_texts::keyboardIsPutAway()
{
    QFETCH(Road, road);
    tapText(1);
    tapText(1);
    QVERIFY(scene()->itemIsEditorInteraction());
    QVERIFY(m_keyboard.isUp());
    m_keyboard.type(QStringLiteral("x"));
    take(road);
    if (road == NewTextAgain) {
        QVERIFY(m_keyboard.isUp()); // for the new text
        take(Close);
    }
    QVERIFY(!m_keyboard.isUp());
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    if (road == CloseWithQuestion)
        QVERIFY(m_window->isVisible());
}

void tst_titlerwindow_texts::sizeFieldsKeyboardIsPutAway_data()
{
    rowsOf<Road>("road");
}

void tst_titlerwindow_texts::sizeFieldsKeyboardIsPutAway()
{
    QFETCH(Road, road);
    tapText(1);
    tapText(1);
    auto* box = panel()->findChild<QWidget*>(QStringLiteral("SizeBox"));
    QVERIFY(box);
    tap(box, QPoint(20, box->height() / 2));
    QVERIFY(m_keyboard.isUp() && m_keyboard.isForLine());
    take(road);
    if (road == NewTextAgain) {
        QVERIFY(m_keyboard.isUp() && !m_keyboard.isForLine());
        return;
    }
    QVERIFY(!m_keyboard.isUp());
    m_keyboard.settle();
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
}

Looks tst_titlerwindow_texts::looksOfNewText(const QString& typed)
{
    m_window->slotNewTextButtonClicked();
    const GraphicsText* item = scene()->getTextItemList().constLast();
    m_keyboard.type(typed);
    const auto& styles = item->getItemTText()->textItems();
    return styles.empty() ? Looks{0} : Looks::of(*styles.front());
}

void tst_titlerwindow_texts::newTextLooksAsThePanelShows_data()
{
    rowsOf<Chosen>("chosen");
}

void tst_titlerwindow_texts::newTextLooksAsThePanelShows()
{
    QFETCH(Chosen, chosen);
    tapTitle(2);
    switch (chosen) {
    case Selected:
        tapText(1);
        break;
    case LeftAgain:
        tapText(1);
        tap(view(), EMPTY_PLACE);
        QVERIFY(!scene()->itemIsSelectionMode());
        break;
    case Edited:
        tapText(1);
        tapText(1);
        QVERIFY(scene()->itemIsEditorInteraction());
        break;
    case AfterAnother:
        tapText(2);
        tapText(1);
        break;
    case SelectedInNewLanguage:
        m_window->slotInputLanguageChanged(SystemSetupDef::emInputLanguageJapanese);
        tapText(1);
        break;
    }
    QCOMPARE(looksOfNewText().told(), Looks().told());
}

// A text in a language just chosen begins with the family of that language, and the panel says so before.
void tst_titlerwindow_texts::newLanguageShowsItsFamily()
{
    const auto* family = panel()->findChild<QComboBox*>(QStringLiteral("FamilyBox"));
    QVERIFY(family);
    const QString before = family->currentText();
    m_window->slotInputLanguageChanged(SystemSetupDef::emInputLanguageUnknown);
    QCOMPARE(family->currentText(), before);
    m_window->slotInputLanguageChanged(SystemSetupDef::emInputLanguageJapanese);
    QCOMPARE(family->currentText(), QStringLiteral("KST Japanese Pro"));
    QCOMPARE(looksOfNewText(QString::fromUtf8("速")).family, std::string("KST Japanese Pro"));
    // A selected text is shown as it is.
    tap(view(), EMPTY_PLACE);
    tapText(1);
    const QString shown = family->currentText();
    m_window->slotInputLanguageChanged(SystemSetupDef::emInputLanguageKorean);
    QCOMPARE(family->currentText(), shown);
}

void tst_titlerwindow_texts::previewedColorIsNotTaken()
{
    tapTitle(2);
    tapText(1);
    tapPanel("TextColor");
    auto* palette = panel()->findChild<ColorPalette*>();
    QVERIFY(palette && palette->isVisible());
    palette->findChildren<ColorButton*>().at(1)->click();
    QCOMPARE(scene()->findTextItem(1)->getItemTText()->textItems().front()->getFontColor(),
             std::string("#C6C6C6"));
    QCOMPARE(looksOfNewText().told(), Looks().told());
    QVERIFY(!palette->isVisible());
}

void tst_titlerwindow_texts::previewedColorIsNotTakenInTheNextSession()
{
    const Looks remembered = looksOfNewText();
    tap(view(), EMPTY_PLACE);
    tapText(1);
    tapPanel("TextColor");
    panel()->findChild<ColorPalette*>()->findChildren<ColorButton*>().at(15)->click();
    m_window->closeTitlerWindow();
    QVERIFY(!m_window->isVisible());
    show();
    QCOMPARE(looksOfNewText().color, remembered.color);
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName(QStringLiteral("Titler"));
    QApplication::setQuitOnLastWindowClosed(false);
    tst_titlerwindow_texts test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_titlerwindow_texts.moc"
