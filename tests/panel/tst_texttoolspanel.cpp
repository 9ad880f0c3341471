// The panel as a whole: what reaches the canvas and the log, what a selection shows, who is enabled when.
#include "PanelFixture.h"
#include "tests/support/Patience.h"

#include "document/SettingManager.h"
#include "panel/AlignToolBox.h"
#include "panel/BoldToolBox.h"
#include "panel/EdgeSizeSlider.h"
#include "panel/EdgeToolBox.h"
#include "panel/FamilyToolBox.h"
#include "panel/FontCombox.h"
#include "panel/ItalicToolBox.h"
#include "panel/KerningToolBox.h"
#include "panel/RangeOfMoveText.h"
#include "panel/ShadowToolBox.h"
#include "panel/SizeToolBox.h"
#include "panel/TextColorToolBox.h"
#include "touchui/KSSLider.h"

#include <QLineEdit>
#include <QRadioButton>

class tst_texttoolspanel : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { m_environment = std::make_unique<PanelEnvironment>(); }
    void cleanupTestCase() { m_environment.reset(); }
    void init();
    void cleanup();
    void withoutAStyleNothingHappens();
    void changesByTap_data();
    void changesByTap();
    void sizesGoToTheirCharacters();
    void shadowTable();
    void moveChangesThePlace();
    void edgeKindsKeepTheRest();
    void edgeLog_data();
    void edgeLog();
    void sliderLogsItsCommitOnce();
    void mutedChangesAreLoggedOnly();
    void badIndicesAreDropped();
    void copyIsOnlyLent();
    void mixedSelectionShows();
    void showingSendsNothing();
    void mixedBoldTurnsAllOn();
    void recordWithoutCharactersIsIgnored();
    void previewKeepsTheSlidersPlace();
    void enableRules();
    void selectionModes();
    void newTextTakesWhatIsShown();
    void newTextWithoutAFamily();
    void styleIsRemembered();
    void movesAndPreviewsAreNotRemembered();
    void brokenSettings();
    void halfTypedSizeIsDropped_data();
    void halfTypedSizeIsDropped();
    void languages();
    void forwarders();

private:
    template <typename Box>
    Box* box() const
    {
        return m_panel->find<Box>();
    }

    std::unique_ptr<PanelEnvironment> m_environment;
    std::unique_ptr<Panel> m_panel;
};

void tst_texttoolspanel::init()
{
    m_environment->messages.posted.clear();
    QFile::remove(QString::fromStdWString(IPathManagerEx::getInstance()->getSystemSettingPath()) +
                  QString::fromLatin1(SettingManager::SETTING_FILENAME));
    m_panel = std::make_unique<Panel>(*m_environment);
    QVERIFY(QTest::qWaitForWindowActive(&m_panel->window, PATIENCE_MS));
}

void tst_texttoolspanel::cleanup()
{
    m_panel.reset();
}

void tst_texttoolspanel::withoutAStyleNothingHappens()
{
    m_environment->newLogLines();
    TextToolsPanel* panel = m_panel->panel;
    QVERIFY(!panel->workingStyle());
    panel->changeFamily(QStringLiteral("KST"), 0);
    panel->changeSize({20}, 1);
    panel->changeBold(1, 2);
    panel->changeItalic(1, 3);
    panel->changeTextColor(QStringLiteral("#000000"), 4, 2);
    panel->changeEdge(1, TEdge(), 5, 1, 1);
    panel->changeShadow(1, 8);
    panel->changeAlign(1, 9);
    panel->changeKerning(1, 10);
    panel->changeMoveRange(2, 0, 11);
    panel->updateTextStyle(nullptr);
    QVERIFY(m_panel->sent.isEmpty());
    QVERIFY(m_environment->newLogLines().isEmpty());
}

void tst_texttoolspanel::changesByTap_data()
{
    QTest::addColumn<QString>("button");
    QTest::addColumn<int>("id");
    QTest::addColumn<QString>("log");
    QTest::newRow("bold") << "Icon_Bold" << 2 << "Adjust Bold to with bold";
    QTest::newRow("italic") << "Icon_Italic" << 3 << "Adjust Italic to with Italic";
    QTest::newRow("size up") << "Icon_SizeUp" << 1 << "Adjust Font Size to 66";
    QTest::newRow("size down") << "Icon_SizeDown" << 1 << "Adjust Font Size to 60";
    QTest::newRow("edge on") << "Icon_EdgeOn" << 5 << "Adjust Edge to  with Edge";
    QTest::newRow("shadow") << "Icon_ShadowRight" << 8 << "Adjust shadow ";
    QTest::newRow("align") << "Icon_AlignCenter" << 9 << "Adjust Alignment";
    QTest::newRow("kerning") << "Icon_KerningLarger" << 10 << "Adjust Space ";
    QTest::newRow("up") << "Icon_MoveUp" << 11 << "Move Text Object 2 px to the up";
    QTest::newRow("right") << "Icon_MoveRight" << 11 << "Move Text Object 2 px to the right";
    QTest::newRow("down") << "Icon_MoveDown" << 11 << "Move Text Object 2 px to the down";
    QTest::newRow("left") << "Icon_MoveLeft" << 11 << "Move Text Object 2 px to the left";
}

void tst_texttoolspanel::changesByTap()
{
    QFETCH(QString, button);
    QFETCH(int, id);
    QFETCH(QString, log);
    const TText before = plainText();
    m_panel->select(before);
    m_panel->tap(button.toLatin1().constData());
    QCOMPARE(m_environment->newLogLines(), QStringList{QStringLiteral("[Text Property Area] 200: ") + log});
    QCOMPARE(m_panel->sent.size(), 1);
    QCOMPARE(m_panel->sent.first().id, id);
    QCOMPARE(m_panel->sent.first().undoFlag, 1);
    QVERIFY(!(m_panel->sent.first().style == before));
    QVERIFY(m_panel->sent.first().style == *m_panel->panel->workingStyle());
}

void tst_texttoolspanel::sizesGoToTheirCharacters()
{
    m_panel->select(mixedText());
    m_panel->tap("Icon_SizeUp");
    const auto& items = m_panel->sent.first().style.textItems();
    QCOMPARE(items[0]->getFontSize(), 66);
    QCOMPARE(items[1]->getFontSize(), 44);
    QCOMPARE(items[2]->getFontSize(), 66);
    QCOMPARE(m_environment->newLogLines(),
             QStringList{QStringLiteral("[Text Property Area] 200: Adjust Font Size to 66")});
    // A list that is too short or too long changes the characters it covers.
    m_panel->panel->changeSize({30}, 1);
    QCOMPARE(m_panel->sent.last().style.textItems()[0]->getFontSize(), 30);
    QCOMPARE(m_panel->sent.last().style.textItems()[1]->getFontSize(), 44);
    m_panel->panel->changeSize({31, 32, 33, 34, 35}, 1);
    QCOMPARE(m_panel->sent.last().style.textItems()[2]->getFontSize(), 33);
    const qsizetype sent = m_panel->sent.size();
    m_panel->panel->changeSize({}, 1);
    QCOMPARE(m_panel->sent.size(), sent);
}

void tst_texttoolspanel::shadowTable()
{
    m_panel->select(plainText());
    const QList<QPoint> directions{{0, 0}, {4, 4}, {0, 4}, {-4, 4}};
    for (int style = 0; style < 4; ++style) {
        m_panel->panel->changeShadow(style, 8);
        const TText& sent = m_panel->sent.last().style;
        QCOMPARE(sent.getShadowStyle(), style);
        QCOMPARE(
            QPoint(sent.getTextShadow()->getShadowDirectionX(), sent.getTextShadow()->getShadowDirectionY()),
            directions.at(style));
        QCOMPARE(sent.getTextShadow()->getShadowColor(), std::string("#000000"));
    }
}

void tst_texttoolspanel::moveChangesThePlace()
{
    m_panel->select(plainText());
    m_environment->tap(m_panel->find<QRadioButton>("MoveRange1"));
    m_panel->tap("Icon_MoveUp");
    QCOMPARE(m_panel->sent.last().style.getYValue(), 190.0f);
    m_panel->tap("Icon_MoveLeft");
    QCOMPARE(m_panel->sent.last().style.getXValue(), 90.0f);
    m_environment->tap(m_panel->find<QRadioButton>("MoveRange0"));
    m_panel->tap("Icon_MoveDown");
    QCOMPARE(m_panel->sent.last().style.getYValue(), 192.0f);
    m_panel->tap("Icon_MoveRight");
    QCOMPARE(m_panel->sent.last().style.getXValue(), 92.0f);
}

void tst_texttoolspanel::edgeKindsKeepTheRest()
{
    TEdge edge;
    edge.setEdgeWidth(9);
    edge.setEdgeColor("#00C743");
    const TText before = mixedText();
    for (const int kind : {1, 2, 3, 4}) {
        m_panel->select(before);
        m_panel->panel->changeEdge(1, edge, 7, 1, kind);
        for (size_t i = 0; i < 3; ++i) {
            const TextStyle& was = *before.textItems()[i];
            const TextStyle& is = *m_panel->sent.last().style.textItems()[i];
            QCOMPARE(is.isTextEdge(), kind == 1 ? 1 : was.isTextEdge());
            QCOMPARE(is.getTextEdge().getEdgeWidth(), kind == 2 ? 9 : was.getTextEdge().getEdgeWidth());
            QCOMPARE(is.getTextEdge().getEdgeColor(),
                     kind == 3 ? std::string("#00C743") : was.getTextEdge().getEdgeColor());
        }
    }
}

void tst_texttoolspanel::edgeLog_data()
{
    QTest::addColumn<int>("on");
    QTest::addColumn<int>("undoFlag");
    QTest::addColumn<int>("kind");
    QTest::addColumn<QString>("log");
    QTest::newRow("on") << 1 << 1 << 1 << "Adjust Edge to  with Edge";
    QTest::newRow("off") << 0 << 1 << 1 << "Adjust Edge to  without Edge";
    QTest::newRow("width dragged") << 1 << 0 << 2 << "";
    QTest::newRow("width") << 1 << 1 << 2 << "Adjust Edge Width to 7";
    QTest::newRow("colour tried") << 1 << 0 << 3 << "Adjust Edge Color to #00C743";
    QTest::newRow("colour") << 1 << 1 << 3 << "Adjust Edge Color to #00C743";
    QTest::newRow("colour cancelled") << 1 << 2 << 3 << "Adjust Edge Color to #00C743";
    QTest::newRow("unknown kind") << 1 << 1 << 9 << "";
}

void tst_texttoolspanel::edgeLog()
{
    QFETCH(int, on);
    QFETCH(int, undoFlag);
    QFETCH(int, kind);
    QFETCH(QString, log);
    m_panel->select(plainText());
    TEdge edge;
    edge.setEdgeWidth(7);
    edge.setEdgeColor("#00C743");
    m_panel->panel->changeEdge(on, edge, 7, undoFlag, kind);
    const QStringList expected =
        log.isEmpty() ? QStringList() : QStringList{QStringLiteral("[Text Property Area] 200: ") + log};
    QCOMPARE(m_environment->newLogLines(), expected);
    QCOMPARE(m_panel->sent.last().undoFlag, undoFlag);
}

void tst_texttoolspanel::sliderLogsItsCommitOnce()
{
    TText text = plainText();
    for (TextStyle* item : text.textItems())
        item->setIsTextEdge(1);
    m_panel->select(text);
    auto* edge = box<EdgeToolBox>();
    m_panel->tap("EdgeWidth");
    QTRY_VERIFY(edge->sliderIsShown());
    for (const int value : {3, 4, 5, 6})
        edge->slider()->slider()->setValue(value);
    QVERIFY(m_environment->newLogLines().isEmpty());
    QCOMPARE(m_panel->sent.size(), 4);
    for (const SentStyle& preview : std::as_const(m_panel->sent))
        QCOMPARE((QList<int>{preview.id, preview.undoFlag}), (QList<int>{6, 0}));
    edge->hideEdgeSliderMenu();
    QCOMPARE(m_environment->newLogLines(),
             QStringList{QStringLiteral("[Text Property Area] 200: Adjust Edge Width to 6")});
    QCOMPARE((QList<int>{m_panel->sent.last().id, m_panel->sent.last().undoFlag}), (QList<int>{7, 1}));
    // Moved and returned: previews only.
    m_panel->sent.clear();
    m_panel->tap("EdgeWidth");
    edge->slider()->slider()->setValue(9);
    edge->slider()->slider()->setValue(6);
    edge->hideEdgeSliderMenu();
    QCOMPARE(m_panel->sent.size(), 2);
    QVERIFY(m_environment->newLogLines().isEmpty());
}

void tst_texttoolspanel::mutedChangesAreLoggedOnly()
{
    m_panel->select(plainText());
    m_panel->panel->setSignalValue(false);
    m_panel->tap("Icon_Bold");
    QVERIFY(m_panel->sent.isEmpty());
    QCOMPARE(m_environment->newLogLines().size(), 1);
    QCOMPARE(m_panel->panel->workingStyle()->textItems()[0]->isFontBold(), 0);
    m_panel->panel->setSignalValue(true);
    m_panel->tap("Icon_Bold");
    QCOMPARE(m_panel->sent.size(), 1);
}

void tst_texttoolspanel::badIndicesAreDropped()
{
    m_panel->select(plainText());
    for (const int index : {-1, 5, 1000}) {
        m_panel->panel->changeKerning(index, 10);
        m_panel->panel->changeShadow(index == 5 ? 4 : index, 8);
    }
    QVERIFY(m_panel->sent.isEmpty());
}

void tst_texttoolspanel::copyIsOnlyLent()
{
    m_panel->select(plainText());
    // A canvas that answers during the call and changes what it got.
    connect(m_panel->panel, &TextToolsPanel::textStyleChange, this, [this](TText* style, int, int) {
        TText answer(*style);
        answer.textItems()[0]->setFontSize(200);
        m_panel->panel->updateTextStyle(&answer);
        style->releaseVectorTextStyle();
    });
    m_panel->tap("Icon_Bold");
    QCOMPARE(m_panel->panel->workingStyle()->textItems().size(), size_t(3));
    QCOMPARE(m_panel->panel->workingStyle()->textItems()[0]->getFontSize(), 200);
    QCOMPARE(box<SizeToolBox>()->fontSizes(), (QList<int>{200, 64, 64}));
    disconnect(m_panel->panel, &TextToolsPanel::textStyleChange, this, nullptr);
}

void tst_texttoolspanel::mixedSelectionShows()
{
    m_panel->select(mixedText());
    QCOMPARE(box<FamilyToolBox>()->getFontFamily(), QString());
    QCOMPARE(box<SizeToolBox>()->findChild<QLineEdit*>()->text(), QStringLiteral("40+"));
    QCOMPARE(box<BoldToolBox>()->getFontBold(), 0);
    QCOMPARE(box<ItalicToolBox>()->getFontItalic(), 0);
    // The style of the last character is used for the rest.
    QCOMPARE(box<TextColorToolBox>()->getColor(), QStringLiteral("#FFF700"));
    QVERIFY(box<EdgeToolBox>()->isEdgeOn());
    QCOMPARE(box<EdgeToolBox>()->getColor(), QStringLiteral("#C80000"));
    QCOMPARE(box<EdgeToolBox>()->getEdge().getEdgeWidth(), 5);
    QCOMPARE(box<KerningToolBox>()->getKerning(), 4);
    QCOMPARE(box<AlignToolBox>()->getAlign(), 1);
    QCOMPARE(box<ShadowToolBox>()->getShadow(), 2);
    TText even = plainText();
    for (TextStyle* item : even.textItems()) {
        item->setFontBold(7);
        item->setIsTextItalic(1);
        item->setTextKerning(95);
    }
    m_panel->select(even);
    QCOMPARE(box<FamilyToolBox>()->getFontFamily(), QStringLiteral("KST"));
    QCOMPARE(box<BoldToolBox>()->getFontBold(), 1);
    QCOMPARE(box<ItalicToolBox>()->getFontItalic(), 1);
    QCOMPARE(box<KerningToolBox>()->getKerning(), -1);
}

void tst_texttoolspanel::showingSendsNothing()
{
    for (int round = 0; round < 3; ++round) {
        TText first = mixedText();
        TText second = plainText();
        m_panel->panel->updateTextStyle(&first);
        m_panel->panel->updateTextStyle(&second);
        m_panel->panel->changeFontPropertyBtnStatus(false);
        m_panel->panel->changeFontPropertyBtnStatus(true);
        m_panel->panel->selectionModeForShadowAndAlign(round % 2 == 0, round % 2 == 1);
    }
    QVERIFY(m_panel->sent.isEmpty());
    QVERIFY(m_environment->newLogLines().isEmpty());
    QVERIFY(m_environment->messages.posted.isEmpty());
}

void tst_texttoolspanel::mixedBoldTurnsAllOn()
{
    m_panel->select(mixedText());
    m_panel->tap("Icon_Bold");
    for (const TextStyle* item : m_panel->sent.last().style.textItems())
        QCOMPARE(item->isFontBold(), 1);
    m_panel->tap("Icon_Bold");
    for (const TextStyle* item : m_panel->sent.last().style.textItems())
        QCOMPARE(item->isFontBold(), 0);
    QCOMPARE(m_environment->newLogLines().last(),
             QStringLiteral("[Text Property Area] 200: Adjust Bold to without bold"));
}

void tst_texttoolspanel::recordWithoutCharactersIsIgnored()
{
    m_panel->select(mixedText());
    TText empty;
    m_panel->panel->updateTextStyle(&empty);
    QCOMPARE(m_panel->panel->workingStyle()->textItems().size(), size_t(3));
}

void tst_texttoolspanel::previewKeepsTheSlidersPlace()
{
    TText text = plainText();
    for (TextStyle* item : text.textItems())
        item->setIsTextEdge(1);
    m_panel->select(text);
    // The canvas answers a preview with its own value; an edge wider than the slider's range would move the
    // handle.
    connect(m_panel->panel, &TextToolsPanel::textStyleChange, this, [this](TText* style, int id, int) {
        TText answer(*style);
        if (id == 6)
            answer.textItems().back()->setTextEdge(TEdge());
        m_panel->panel->updateTextStyle(&answer);
    });
    auto* edge = box<EdgeToolBox>();
    m_panel->tap("EdgeWidth");
    QTRY_VERIFY(edge->sliderIsShown());
    edge->slider()->slider()->setValue(8);
    QCOMPARE(edge->slider()->value(), 8);
    edge->hideEdgeSliderMenu();
    QCOMPARE(m_panel->sent.last().style.textItems()[0]->getTextEdge().getEdgeWidth(), 8);
    disconnect(m_panel->panel, &TextToolsPanel::textStyleChange, this, nullptr);
}

void tst_texttoolspanel::enableRules()
{
    const QList<ToolBox*> always{box<FamilyToolBox>(), box<TextColorToolBox>(), box<SizeToolBox>(),
                                 box<BoldToolBox>(),   box<ItalicToolBox>(),    box<EdgeToolBox>(),
                                 box<KerningToolBox>()};
    const QList<ToolBox*> byMode{box<ShadowToolBox>(), box<AlignToolBox>(), box<RangeOfMoveText>()};
    const auto allAre = [](const QList<ToolBox*>& boxes, bool enabled) {
        return std::all_of(boxes.begin(), boxes.end(),
                           [enabled](const ToolBox* each) { return each->isBoxEnabled() == enabled; });
    };
    QVERIFY(allAre(always, false) && allAre(byMode, false)); // at start
    m_panel->panel->changeFontPropertyBtnStatus(true);
    QVERIFY(allAre(always, true) && allAre(byMode, false));
    m_panel->panel->selectionModeForShadowAndAlign(true, true);
    QVERIFY(allAre(byMode, true));
    m_panel->panel->changeFontPropertyBtnStatus(false);
    QVERIFY(allAre(always, false) && allAre(byMode, false));
    m_panel->panel->changeFontPropertyBtnStatus(true); // the modes are kept
    QVERIFY(allAre(always, true) && allAre(byMode, true));
    m_panel->select(plainText());
    m_panel->panel->initTextToolsPanel();
    QVERIFY(allAre(always, false) && allAre(byMode, false));
    QVERIFY(!m_panel->panel->workingStyle());
    for (const char* name : {"Icon_Bold", "Icon_SizeUp", "Icon_AlignRight", "Icon_MoveUp", "TextColor"})
        m_panel->tap(name);
    QVERIFY(m_panel->sent.isEmpty());
    QVERIFY(!m_panel->panel->colorPaletteIsShown());
}

void tst_texttoolspanel::selectionModes()
{
    m_panel->panel->changeFontPropertyBtnStatus(true);
    for (const bool shadowAlign : {true, false}) {
        for (const bool move : {true, false}) {
            m_panel->panel->selectionModeForShadowAndAlign(shadowAlign, move);
            QCOMPARE(box<ShadowToolBox>()->isBoxEnabled(), shadowAlign);
            QCOMPARE(box<AlignToolBox>()->isBoxEnabled(), shadowAlign);
            QCOMPARE(box<RangeOfMoveText>()->isBoxEnabled(), move);
            QCOMPARE(m_panel->find<QWidget>("Icon_MoveUp")->isEnabled(), move);
            QCOMPARE(m_panel->find<QWidget>("MoveRange0")->isEnabled(), move);
        }
    }
}

void tst_texttoolspanel::newTextTakesWhatIsShown()
{
    TText got;
    connect(m_panel->panel, &TextToolsPanel::signalUpdateCurrentTextProperty, this,
            [&got](TText& style) { got = style; });
    TText shown = plainText();
    TextStyle* item = shown.textItems().back();
    for (TextStyle* each : shown.textItems())
        each->setFontBold(1);
    item->setFontColor("#C80000");
    item->setTextKerning(120);
    item->setIsTextEdge(1);
    shown.setTextAlign(0);
    shown.setShadowStyle(3);
    shown.getTextShadow()->setShadowDirectionX(-4);
    m_panel->select(shown);
    m_panel->panel->slotBeginNewTextItem();
    QCOMPARE(got.textItems().size(), size_t(1));
    const TextStyle& style = *got.textItems().front();
    QCOMPARE(style.getFontFamily(), std::string("KST"));
    QCOMPARE(style.getFontSize(), 64);
    QCOMPARE(style.isFontBold(), 1);
    QCOMPARE(style.getFontColor(), std::string("#C80000"));
    QCOMPARE(style.getTextKerning(), 120);
    QCOMPARE(style.isTextEdge(), 1);
    QCOMPARE(got.getTextAlign(), 0);
    QCOMPARE(got.getShadowStyle(), 3);
    QCOMPARE(got.getTextShadow()->getShadowDirectionX(), -4);
    disconnect(m_panel->panel, &TextToolsPanel::signalUpdateCurrentTextProperty, this, nullptr);
}

void tst_texttoolspanel::newTextWithoutAFamily()
{
    std::string family;
    connect(m_panel->panel, &TextToolsPanel::signalUpdateCurrentTextProperty, this,
            [&family](TText& style) { family = style.textItems().front()->getFontFamily(); });
    m_panel->panel->displayInputLanguage(SystemSetupDef::emInputLanguageJapanese);
    m_panel->select(mixedText());
    m_panel->panel->slotBeginNewTextItem();
    QCOMPARE(family, std::string("KST Japanese Pro"));
    disconnect(m_panel->panel, &TextToolsPanel::signalUpdateCurrentTextProperty, this, nullptr);
}

void tst_texttoolspanel::styleIsRemembered()
{
    m_panel->select(plainText());
    m_panel->tap("Icon_Bold");
    m_panel->tap("Icon_SizeUp");
    m_panel->tap("Icon_ShadowCenter");
    m_panel->tap("Icon_AlignRight");
    m_panel->tap("Icon_EdgeOn");
    m_panel->tap("Icon_KerningLarger");
    const FontStyle remembered = TextToolsPanelController().getLastTextStyle();
    QCOMPARE(remembered.getSize(), 66);
    QCOMPARE(remembered.getBold(), 1);
    QCOMPARE(remembered.getShadowStyle(), 2);
    QCOMPARE(remembered.getAlign(), 1);
    QCOMPARE(remembered.getEdge(), 1);
    QCOMPARE(remembered.getKerning(), 110);
    // The next session shows the value, disabled.
    m_panel->panel->initTextToolsPanel();
    QCOMPARE(box<SizeToolBox>()->fontSizes(), QList<int>{66});
    QCOMPARE(box<BoldToolBox>()->getFontBold(), 1);
    QCOMPARE(box<ShadowToolBox>()->getShadow(), 2);
    QCOMPARE(box<AlignToolBox>()->getAlign(), 1);
    QVERIFY(box<EdgeToolBox>()->isEdgeOn());
    QCOMPARE(box<KerningToolBox>()->getKerning(), 3);
    QVERIFY(!box<BoldToolBox>()->isBoxEnabled());
}

void tst_texttoolspanel::movesAndPreviewsAreNotRemembered()
{
    m_panel->select(mixedText());
    m_panel->tap("Icon_MoveUp");
    m_panel->panel->changeTextColor(QStringLiteral("#00C743"), 4, 0);
    FontStyle style;
    QCOMPARE(SettingManager().loadLastTextParameter(&style), 0);
    m_environment->newDebugLines();
    QCOMPARE(TextToolsPanelController().getLastTextStyle().getSize(), 96);
    QCOMPARE(m_environment->newDebugLines(),
             QStringList("[TextToolsPanelController] 200: read xml file failed"));
}

void tst_texttoolspanel::brokenSettings()
{
    QFile file(QString::fromStdWString(IPathManagerEx::getInstance()->getSystemSettingPath()) +
               QString::fromLatin1(SettingManager::SETTING_FILENAME));
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write(
        "<manifest><font-style size=\"-5\" kerning=\"x\" align=\"77\" shadow=\"9\" edge-width=\"999999\" "
        "color=\"nonsense\" family=\"Nobody's Font\"/></manifest>");
    file.close();
    m_panel->panel->initTextToolsPanel();
    m_panel->panel->changeFontPropertyBtnStatus(true);
    m_panel->panel->selectionModeForShadowAndAlign(true, true);
    m_panel->panel->slotBeginNewTextItem();
    m_panel->select(plainText());
    m_panel->tap("Icon_SizeUp");
    QCOMPARE(m_panel->sent.last().style.textItems()[0]->getFontSize(), 66);
}

void tst_texttoolspanel::halfTypedSizeIsDropped_data()
{
    QTest::addColumn<QString>("button");
    for (const char* name :
         {"Icon_Bold", "Icon_Italic", "Icon_AlignCenter", "Icon_ShadowRight", "Icon_EdgeOff",
          "Icon_KerningSmaller", "Icon_MoveUp", "MoveRange1", "TextColor", "Icon_SizeUp"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_texttoolspanel::halfTypedSizeIsDropped()
{
    QFETCH(QString, button);
    m_panel->select(mixedText());
    auto* edit = box<SizeToolBox>()->findChild<QLineEdit*>();
    m_environment->touch(edit->parentWidget(), edit->geometry().center());
    QVERIFY(box<SizeToolBox>()->isEditing());
    edit->selectAll();
    edit->insert(QStringLiteral("7"));
    m_panel->tap(button.toLatin1().constData());
    QVERIFY(!box<SizeToolBox>()->isEditing());
    QVERIFY(m_environment->messages.posted.isEmpty());
    for (const SentStyle& sent : std::as_const(m_panel->sent)) {
        const int size = sent.style.textItems()[0]->getFontSize();
        QCOMPARE(size, button == QLatin1String("Icon_SizeUp") ? 66 : 64);
    }
}

void tst_texttoolspanel::languages()
{
    TextToolsPanel* panel = m_panel->panel;
    const QList<std::pair<int, const char*>> families{{7, "KST Japanese Pro"},
                                                      {8, "YDGothic 100 Pro"},
                                                      {9, "DFHeiW5-A"},
                                                      {10, "DFHeiW5-A"},
                                                      {0, "KST"},
                                                      {99, "KST"}};
    for (const auto& [language, family] : families) {
        panel->displayInputLanguage(static_cast<SystemSetupDef::emInputLanguageType>(language));
        QCOMPARE(panel->defaultFamily(), QString::fromLatin1(family));
    }
    panel->setModuleInfo(SystemSetupDef::emInformationModelChina);
    panel->displayInputLanguage(SystemSetupDef::emInputLanguageKorean);
    QCOMPARE(panel->defaultFamily(), QStringLiteral("DFHeiW5-A"));
}

void tst_texttoolspanel::forwarders()
{
    TextToolsPanel* panel = m_panel->panel;
    QSignalSpy slider(panel, &TextToolsPanel::signalShowEdgeSlider);
    QSignalSpy families(panel, &TextToolsPanel::signalShowFontFamilyComboxList);
    QSignalSpy sizes(panel, &TextToolsPanel::signalShowFontSizeComboxList);
    QSignalSpy done(panel, &TextToolsPanel::signalNotifyEditAreaSizeToolBoxEditDone);
    TText text = plainText();
    text.textItems().back()->setIsTextEdge(1);
    m_panel->select(text);
    m_panel->tap("EdgeWidth");
    QVERIFY(panel->edgeSliderIsShown());
    panel->slotCanvasSceneMouseTouched();
    QVERIFY(!panel->edgeSliderIsShown());
    QCOMPARE(slider, (QList<QVariantList>{{true}, {false}}));
    m_panel->tap("FamilyBox");
    QCOMPARE(families, (QList<QVariantList>{{true}}));
    panel->hideFontFamilyComboxList();
    QCOMPARE(families, (QList<QVariantList>{{true}, {false}}));
    m_panel->find<KSCombobox>("SizeBox")->showPopup();
    panel->hideFontSizeComboxList();
    QCOMPARE(sizes, (QList<QVariantList>{{true}, {false}}));
    auto* edit = box<SizeToolBox>()->findChild<QLineEdit*>();
    m_environment->touch(edit->parentWidget(), edit->geometry().center());
    panel->slotAbsoluteShowCanvasMenu(false);
    QVERIFY(box<SizeToolBox>()->isEditing());
    panel->slotAbsoluteShowCanvasMenu(true);
    QVERIFY(!box<SizeToolBox>()->isEditing());
    QCOMPARE(done.size(), 1);
    panel->modifyFontFamilyComboxItem(false);
    QCOMPARE(box<FamilyToolBox>()->comboBox()->count(), 1);
    panel->modifyFontFamilyComboxItem(true);
    panel->slotImportNewFontFamlies(QStringLiteral("missing.ttf"));
    QVERIFY(box<FamilyToolBox>()->comboBox()->count() > 1);
    QVERIFY(m_panel->sent.isEmpty());
}

QTEST_MAIN(tst_texttoolspanel)
#include "tst_texttoolspanel.moc"
