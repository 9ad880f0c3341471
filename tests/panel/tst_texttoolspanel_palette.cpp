// The panel's palette: what a chosen colour sends, what Cancel gives back, and what cancels it by itself.
#include "PanelFixture.h"
#include "tests/support/Patience.h"

#include "panel/ColorButton.h"
#include "panel/ColorPalette.h"
#include "panel/TextColorToolBox.h"

class tst_texttoolspanel_palette : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { m_environment = std::make_unique<PanelEnvironment>(); }
    void cleanupTestCase() { m_environment.reset(); }
    void init();
    void cleanup() { m_panel.reset(); }
    void textPaletteOk();
    void textPaletteCancelWithMixedColors();
    void edgePaletteCancelWithMixedColors();
    void otherSelectionCancelsThePalette();
    void otherBoxCancelsThePalette();
    void tapOnTheSameColorKeepsThePalette();
    void otherPaletteCancelsTheFirst();
    void keyboardClosesThePalette();
    void paletteStandsInTheWindow();

private:
    std::unique_ptr<PanelEnvironment> m_environment;
    std::unique_ptr<Panel> m_panel;
};

void tst_texttoolspanel_palette::init()
{
    m_panel = std::make_unique<Panel>(*m_environment);
    QVERIFY(QTest::qWaitForWindowActive(&m_panel->window, PATIENCE_MS));
}

void tst_texttoolspanel_palette::textPaletteOk()
{
    m_panel->select(mixedText());
    m_panel->tap("TextColor");
    auto* palette = m_panel->find<ColorPalette>();
    QTRY_VERIFY(palette->isVisible());
    QCOMPARE(palette->currentColor(), QStringLiteral("#FFF700"));
    m_environment->tap(palette->findChildren<ColorButton*>().at(4));
    QCOMPARE(m_panel->sent.last().id, 4);
    QCOMPARE(m_panel->sent.last().undoFlag, 0);
    QCOMPARE(colorsOf(m_panel->sent.last().style), (QList<QString>{"#000000", "#000000", "#000000"}));
    m_panel->tap("PaletteOK");
    QCOMPARE(m_panel->sent.last().undoFlag, 1);
    QCOMPARE(colorsOf(m_panel->sent.last().style), (QList<QString>{"#000000", "#000000", "#000000"}));
    QCOMPARE(m_panel->sent.size(), 2);
    QCOMPARE(m_environment->newLogLines(),
             (QStringList{"[Text Property Area] 200: Adjust Font Color to #000000",
                          "[Text Property Area] 200: Adjust Font Color to #000000"}));
    QVERIFY(!palette->isVisible());
}

void tst_texttoolspanel_palette::textPaletteCancelWithMixedColors()
{
    // As the canvas does: every change comes back.
    connect(m_panel->panel, &TextToolsPanel::textStyleChange, this, [this](TText* style, int, int) {
        TText answer(*style);
        m_panel->panel->updateTextStyle(&answer);
    });
    const TText before = mixedText();
    m_panel->select(before);
    m_panel->tap("TextColor");
    auto* palette = m_panel->find<ColorPalette>();
    QTRY_VERIFY(palette->isVisible());
    for (const int index : {4, 20, 29})
        m_environment->tap(palette->findChildren<ColorButton*>().at(index));
    m_panel->tap("PaletteCancel");
    QCOMPARE(m_panel->sent.last().undoFlag, 2);
    QCOMPARE(colorsOf(m_panel->sent.last().style), colorsOf(before));
    QCOMPARE(m_panel->sent.size(), 4);
    QVERIFY(m_panel->sent.last().style.textItemsIsTheSame(before));
    disconnect(m_panel->panel, &TextToolsPanel::textStyleChange, this, nullptr);
}

void tst_texttoolspanel_palette::edgePaletteCancelWithMixedColors()
{
    const TText before = mixedText();
    m_panel->select(before);
    m_panel->tap("EdgeColor");
    auto* palette = m_panel->find<ColorPalette>();
    QTRY_VERIFY(palette->isVisible());
    m_environment->tap(palette->findChildren<ColorButton*>().at(0));
    for (const TextStyle* item : m_panel->sent.last().style.textItems())
        QCOMPARE(item->getTextEdge().getEdgeColor(), std::string("#FFFFFF"));
    QCOMPARE((QList<int>{m_panel->sent.last().id, m_panel->sent.last().undoFlag}), (QList<int>{7, 0}));
    m_panel->tap("PaletteCancel");
    QCOMPARE((QList<int>{m_panel->sent.last().id, m_panel->sent.last().undoFlag}), (QList<int>{7, 2}));
    QVERIFY(m_panel->sent.last().style.textItemsIsTheSame(before));
    QCOMPARE(colorsOf(m_panel->sent.last().style), colorsOf(before)); // the text's colours stay
}

void tst_texttoolspanel_palette::otherSelectionCancelsThePalette()
{
    m_panel->select(mixedText());
    m_panel->tap("TextColor");
    auto* palette = m_panel->find<ColorPalette>();
    QTRY_VERIFY(palette->isVisible());
    m_environment->tap(palette->findChildren<ColorButton*>().at(4));
    TText other = plainText();
    for (TextStyle* item : other.textItems())
        item->setFontColor("#00C743");
    m_panel->select(other);
    QVERIFY(!palette->isVisible());
    QCOMPARE((QList<int>{m_panel->sent.last().id, m_panel->sent.last().undoFlag}), (QList<int>{4, 2}));
    QCOMPARE(colorsOf(m_panel->sent.last().style), colorsOf(mixedText()));
    QCOMPARE(m_panel->find<TextColorToolBox>()->getColor(), QStringLiteral("#00C743"));
    QCOMPARE(m_panel->sent.size(), 2);
}

void tst_texttoolspanel_palette::otherBoxCancelsThePalette()
{
    m_panel->select(mixedText());
    m_panel->tap("TextColor");
    auto* palette = m_panel->find<ColorPalette>();
    QTRY_VERIFY(palette->isVisible());
    palette->move(80, 460); // off the panel
    m_environment->tap(palette->findChildren<ColorButton*>().at(4));
    m_panel->tap("Icon_Bold");
    QVERIFY(!palette->isVisible());
    QCOMPARE(m_panel->sent.size(), 3);
    QCOMPARE((QList<int>{m_panel->sent.at(1).id, m_panel->sent.at(1).undoFlag}), (QList<int>{4, 2}));
    QCOMPARE(m_panel->sent.last().id, 2);
    QCOMPARE(colorsOf(m_panel->sent.last().style), colorsOf(mixedText()));
    QCOMPARE(m_panel->panel->workingStyle()->textItems()[2]->isFontBold(), 1);
}

void tst_texttoolspanel_palette::tapOnTheSameColorKeepsThePalette()
{
    m_panel->select(mixedText());
    m_panel->tap("TextColor");
    auto* palette = m_panel->find<ColorPalette>();
    QTRY_VERIFY(palette->isVisible());
    palette->move(80, 460);
    m_environment->tap(palette->findChildren<ColorButton*>().at(4));
    m_panel->tap("TextColor");
    QVERIFY(palette->isVisible());
    m_panel->tap("PaletteCancel");
    QCOMPARE(m_panel->sent.last().undoFlag, 2);
    QCOMPARE(colorsOf(m_panel->sent.last().style), colorsOf(mixedText()));
}

void tst_texttoolspanel_palette::otherPaletteCancelsTheFirst()
{
    m_panel->select(mixedText());
    m_panel->tap("TextColor");
    auto* palette = m_panel->find<ColorPalette>();
    QTRY_VERIFY(palette->isVisible());
    m_environment->tap(palette->findChildren<ColorButton*>().at(4));
    palette->move(80, 460); // off the panel
    m_panel->tap("EdgeColor");
    QCOMPARE((QList<int>{m_panel->sent.last().id, m_panel->sent.last().undoFlag}), (QList<int>{4, 2}));
    QVERIFY(palette->isVisible());
    m_environment->tap(palette->findChildren<ColorButton*>().at(4));
    QCOMPARE(m_panel->sent.last().id, 7);
}

void tst_texttoolspanel_palette::keyboardClosesThePalette()
{
    m_panel->select(mixedText());
    m_panel->tap("TextColor");
    QTRY_VERIFY(m_panel->panel->colorPaletteIsShown());
    m_environment->tap(m_panel->find<ColorPalette>()->findChildren<ColorButton*>().at(4));
    m_panel->panel->slotHideColorPaletteWhenCloseSoftWare();
    QVERIFY(!m_panel->panel->colorPaletteIsShown());
    QCOMPARE(m_panel->sent.size(), 2);
    QCOMPARE(m_panel->sent.last().undoFlag, 2);
    QCOMPARE(colorsOf(m_panel->sent.last().style), colorsOf(mixedText()));
}

void tst_texttoolspanel_palette::paletteStandsInTheWindow()
{
    m_panel->select(plainText());
    m_panel->panel->titlerWindowRectSlot(QRect(1280, 0, 1920, 1080));
    m_panel->tap("TextColor");
    auto* palette = m_panel->find<ColorPalette>();
    QTRY_VERIFY(palette->isVisible());
    QCOMPARE(palette->pos(), QPoint(1920, 350));
}

QTEST_MAIN(tst_texttoolspanel_palette)
#include "tst_texttoolspanel_palette.moc"
