// The tool boxes by themselves: what their buttons emit, how they look, what they keep.
#include "PanelFixture.h"
#include "tests/support/Patience.h"

#include "panel/AlignToolBox.h"
#include "panel/BoldToolBox.h"
#include "panel/ColorButton.h"
#include "panel/EdgeSizeSlider.h"
#include "panel/EdgeToolBox.h"
#include "panel/ItalicToolBox.h"
#include "panel/KerningToolBox.h"
#include "panel/RangeOfMoveText.h"
#include "panel/ShadowToolBox.h"
#include "panel/SizeLadder.h"
#include "panel/TextColorToolBox.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSSLider.h"

#include <QLabel>
#include <QRadioButton>
#include <QTextLayout>
#include <QVBoxLayout>

class tst_toolbox : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { m_environment = std::make_unique<PanelEnvironment>(); }
    void cleanupTestCase() { m_environment.reset(); }
    void init();
    void cleanup();
    void ladder_data();
    void ladder();
    void ladderDisplay();
    void alignChooses();
    void alignShowsItsValueWhenEnabled();
    void toggles();
    void kerningStepsAndStops();
    void kerningShowsItsLevelWhenEnabled();
    void shadowChooses();
    void shadowShowsItsValueWhenEnabled();
    void moveInBothRanges();
    void moveLooksDisabled();
    void edgeSwitch();
    void edgeSliderDragIsOneStep();
    void edgeSliderReturnedIsNoStep();
    void edgeSliderClosesByATouchBeside();
    void edgeSliderIsFramedAllRound();
    void edgeSliderHasNoCorners();
    void rangeOfMoveBreaksInTheMiddle();
    void edgeColorStates();
    void textColorStates();
    void colorButtonText();
    void disabledBoxesIgnoreTaps();
    void resetShowsANewBox();
    void pressedLookOnly();

private:
    template <typename Box>
    Box* show()
    {
        auto* box = new Box(m_window.get());
        m_window->layout()->addWidget(box);
        m_window->show();
        box->setWidgetDisabled();
        box->setWidgetEnabled();
        [&] { QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS)); }();
        return box;
    }
    KSPushbutton* button(const char* name) const
    {
        return m_window->findChild<KSPushbutton*>(QString::fromLatin1(name));
    }
    void tap(const char* name) { m_environment->tap(button(name)); }

    std::unique_ptr<PanelEnvironment> m_environment;
    std::unique_ptr<QWidget> m_window;
};

void tst_toolbox::init()
{
    m_window = std::make_unique<QWidget>();
    m_window->setLayout(new QVBoxLayout);
}

void tst_toolbox::cleanup()
{
    m_window.reset();
}

void tst_toolbox::ladder_data()
{
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("next");
    QTest::addColumn<int>("previous");
    QTest::newRow("least") << 20 << 24 << 20;
    QTest::newRow("below") << 3 << 20 << 20;
    QTest::newRow("zero") << 0 << 20 << 20;
    QTest::newRow("negative") << -7 << 20 << 20;
    QTest::newRow("on the ladder") << 64 << 66 << 60;
    QTest::newRow("off the ladder") << 50 << 54 << 48;
    QTest::newRow("just above the least") << 21 << 24 << 20;
    QTest::newRow("last but one") << 857 << 999 << 714;
    QTest::newRow("above the last but one") << 900 << 999 << 857;
    QTest::newRow("greatest") << 999 << 999 << 857;
    QTest::newRow("beyond") << 5000 << 999 << 999;
}

void tst_toolbox::ladder()
{
    QFETCH(int, value);
    QTEST(SizeLadder::getNextData(value), "next");
    QTEST(SizeLadder::getPreviousData(value), "previous");
}

void tst_toolbox::ladderDisplay()
{
    QCOMPARE(SizeLadder::comboBoxSizes().size(), 13);
    QCOMPARE(SizeLadder::totalSizes().size(), 29);
    QCOMPARE(SizeLadder::displayText({}), QString());
    QCOMPARE(SizeLadder::displayText({64, 64}), QStringLiteral("64"));
    QCOMPARE(SizeLadder::displayText({64, 40, 96}), QStringLiteral("40+"));
    QVERIFY(SizeLadder::allIsMin({20, 20}) && !SizeLadder::allIsMin({20, 24}));
    QVERIFY(SizeLadder::allIsMax({999}) && !SizeLadder::allIsMax({999, 998}));
}

void tst_toolbox::alignChooses()
{
    auto* box = show<AlignToolBox>();
    QSignalSpy spy(box, &AlignToolBox::alignChange);
    QSignalSpy clear(box, &ToolBox::signalClearSizeBoxLineEditFocus);
    tap("Icon_AlignCenter");
    tap("Icon_AlignRight");
    tap("Icon_AlignLeft");
    QCOMPARE(spy, (QList<QVariantList>{{0, 9}, {1, 9}, {-1, 9}}));
    QCOMPARE(clear, (QList<QVariantList>{{true}, {true}, {true}}));
    QVERIFY(button("Icon_AlignLeft")->isSelected());
    QVERIFY(!button("Icon_AlignCenter")->isSelected() && !button("Icon_AlignRight")->isSelected());
    QCOMPARE(box->getAlign(), -1);
}

void tst_toolbox::alignShowsItsValueWhenEnabled()
{
    auto* box = show<AlignToolBox>();
    QSignalSpy spy(box, &AlignToolBox::alignChange);
    box->setAlign(1);
    QVERIFY(button("Icon_AlignLeft")->isSelected()); // still
    box->setWidgetEnabled();
    QVERIFY(button("Icon_AlignRight")->isSelected());
    box->setAlign(5);
    box->setWidgetEnabled();
    for (const char* name : {"Icon_AlignLeft", "Icon_AlignCenter", "Icon_AlignRight"})
        QVERIFY(!button(name)->isSelected());
    QVERIFY(spy.isEmpty());
}

void tst_toolbox::toggles()
{
    auto* bold = show<BoldToolBox>();
    auto* italic = show<ItalicToolBox>();
    QSignalSpy boldSpy(bold, &BoldToolBox::boldChange);
    QSignalSpy italicSpy(italic, &ItalicToolBox::italicChange);
    bold->setFontBold(1);
    italic->setFontItalic(-1);
    QVERIFY(button("Icon_Bold")->isSelected());
    QVERIFY(!button("Icon_Italic")->isSelected());
    tap("Icon_Bold");
    tap("Icon_Italic");
    tap("Icon_Italic");
    QCOMPARE(boldSpy, (QList<QVariantList>{{0, 2}}));
    QCOMPARE(italicSpy, (QList<QVariantList>{{1, 3}, {0, 3}}));
}

void tst_toolbox::kerningStepsAndStops()
{
    auto* box = show<KerningToolBox>();
    QSignalSpy spy(box, &KerningToolBox::kerningChange);
    tap("Icon_KerningLarger");
    tap("Icon_KerningLarger");
    QVERIFY(!button("Icon_KerningLarger")->isEnabled());
    tap("Icon_KerningLarger"); // disabled at 120: no signal
    QCOMPARE(spy, (QList<QVariantList>{{3, 10}, {4, 10}}));
    spy.clear();
    for (int i = 0; i < 5; ++i)
        tap("Icon_KerningSmaller");
    QCOMPARE(spy, (QList<QVariantList>{{3, 10}, {2, 10}, {1, 10}, {0, 10}}));
    QVERIFY(!button("Icon_KerningSmaller")->isEnabled() && button("Icon_KerningLarger")->isEnabled());
}

void tst_toolbox::kerningShowsItsLevelWhenEnabled()
{
    auto* box = show<KerningToolBox>();
    const QList<std::tuple<int, bool, bool>> expected{
        {0, false, true}, {1, true, true}, {3, true, true}, {4, true, false}, {-1, true, true}};
    for (const auto& [level, smaller, larger] : expected) {
        box->setKerning(level);
        box->setWidgetEnabled();
        QCOMPARE(button("Icon_KerningSmaller")->isEnabled(), smaller);
        QCOMPARE(button("Icon_KerningLarger")->isEnabled(), larger);
    }
    // A spacing between two levels is raised from the lower level.
    QSignalSpy spy(box, &KerningToolBox::kerningChange);
    tap("Icon_KerningSmaller");
    QCOMPARE(spy, (QList<QVariantList>{{0, 10}}));
}

void tst_toolbox::shadowChooses()
{
    auto* box = show<ShadowToolBox>();
    QSignalSpy spy(box, &ShadowToolBox::shadowChange);
    for (const char* name : {"Icon_ShadowRight", "Icon_ShadowCenter", "Icon_ShadowLeft", "Icon_ShadowOff"}) {
        tap(name);
        QVERIFY(button(name)->isSelected());
    }
    QCOMPARE(spy, (QList<QVariantList>{{1, 8}, {2, 8}, {3, 8}, {0, 8}}));
    QVERIFY(!button("Icon_ShadowLeft")->isSelected());
}

void tst_toolbox::shadowShowsItsValueWhenEnabled()
{
    auto* box = show<ShadowToolBox>();
    QSignalSpy spy(box, &ShadowToolBox::shadowChange);
    box->setShadow(3);
    QVERIFY(button("Icon_ShadowOff")->isSelected());
    box->setWidgetEnabled();
    QVERIFY(button("Icon_ShadowLeft")->isSelected());
    box->setShadow(ShadowToolBox::USELESS_VALUE);
    box->setWidgetEnabled();
    QVERIFY(!button("Icon_ShadowLeft")->isSelected());
    QVERIFY(spy.isEmpty());
}

void tst_toolbox::moveInBothRanges()
{
    auto* box = show<RangeOfMoveText>();
    QSignalSpy spy(box, &RangeOfMoveText::moveRangeChanged);
    QSignalSpy clear(box, &ToolBox::signalClearSizeBoxLineEditFocus);
    tap("Icon_MoveUp");
    m_environment->tap(m_window->findChild<QRadioButton*>(QStringLiteral("MoveRange1")));
    tap("Icon_MoveRight");
    tap("Icon_MoveDown");
    m_environment->tap(m_window->findChild<QRadioButton*>(QStringLiteral("MoveRange0")));
    tap("Icon_MoveLeft");
    QCOMPARE(spy, (QList<QVariantList>{{2, 0, 11}, {10, 1, 11}, {10, 2, 11}, {2, 3, 11}}));
    QVERIFY(clear.contains(QVariantList{true}) && !clear.contains(QVariantList{false}));
}

void tst_toolbox::moveLooksDisabled()
{
    auto* box = show<RangeOfMoveText>();
    const auto labels = box->findChildren<QLabel*>();
    for (const QLabel* label : labels)
        QCOMPARE(label->styleSheet(), QStringLiteral("font:20px; color:rgb(220, 220, 220);"));
    box->setWidgetDisabled();
    for (const QLabel* label : labels)
        QCOMPARE(label->styleSheet(), QStringLiteral("font:20px; color:rgb(40, 40, 40);"));
    for (const QAbstractButton* each : box->findChildren<QAbstractButton*>())
        QVERIFY(!each->isEnabled());
}

void tst_toolbox::edgeSwitch()
{
    auto* box = show<EdgeToolBox>();
    QSignalSpy spy(box, &EdgeToolBox::edgeChange);
    QVERIFY(!button("EdgeWidth")->isEnabled() && !button("EdgeColor")->isEnabled());
    QVERIFY(!button("Icon_EdgeOff")->isEnabled() && button("Icon_EdgeOff")->isSelected());
    tap("Icon_EdgeOn");
    QVERIFY(!button("Icon_EdgeOn")->isEnabled() && button("Icon_EdgeOn")->isSelected());
    QCOMPARE(button("Icon_EdgeOn")->paintedState(), KSPushbutton::ButtonSelectedRest);
    QVERIFY(button("EdgeWidth")->isEnabled() && button("EdgeColor")->isEnabled());
    tap("Icon_EdgeOff");
    QCOMPARE(spy.size(), 2);
    for (const int on : {1, 0}) {
        const QVariantList arguments = spy.at(1 - on);
        QCOMPARE(arguments.at(0).toInt(), on);
        QCOMPARE(arguments.mid(2), (QVariantList{5, 1, 1}));
    }
}

void tst_toolbox::edgeSliderDragIsOneStep()
{
    auto* box = show<EdgeToolBox>();
    TEdge edge;
    edge.setEdgeWidth(2);
    box->setEdge(1, edge, false);
    QSignalSpy spy(box, &EdgeToolBox::edgeChange);
    QSignalSpy shown(box, &EdgeToolBox::signalShowEdgeSlider);
    tap("EdgeWidth");
    QTRY_VERIFY(box->sliderIsShown());
    QCOMPARE(shown, (QList<QVariantList>{{true}}));
    // A finger drags the handle to the right end.
    KSSLider* slider = box->slider()->slider();
    QVERIFY(QTest::qWaitForWindowExposed(box->slider(), PATIENCE_MS));
    const QPoint handle = slider->handleRect().center();
    QTest::touchEvent(slider, m_environment->device).press(0, handle, slider);
    for (int x = handle.x(); x < slider->width() + 40; x += 20)
        QTest::touchEvent(slider, m_environment->device).move(0, QPoint(x, handle.y()), slider);
    QTest::touchEvent(slider, m_environment->device)
        .release(0, QPoint(slider->width() + 40, handle.y()), slider);
    QCOMPARE(slider->value(), 10);
    QCOMPARE(m_environment->newLogLines(),
             QStringList{QStringLiteral("[Text Property Area] 200: Adjust Edge Width to ")});
    QVERIFY(!spy.isEmpty());
    for (const QVariantList& preview : std::as_const(spy)) {
        QCOMPARE(preview.at(0).toInt(), 1);
        QCOMPARE(preview.mid(2), (QVariantList{6, 0, 2}));
    }
    QCOMPARE(button("EdgeWidth")->text(), QStringLiteral("10"));
    spy.clear();
    box->hideEdgeSliderMenu();
    QCOMPARE(spy.size(), 1);
    QCOMPARE(spy.first().at(1).value<TEdge>().getEdgeWidth(), 10);
    QCOMPARE(spy.first().mid(2), (QVariantList{7, 1, 2}));
    QCOMPARE(shown, (QList<QVariantList>{{true}, {false}}));
}

void tst_toolbox::edgeSliderReturnedIsNoStep()
{
    auto* box = show<EdgeToolBox>();
    TEdge edge;
    edge.setEdgeWidth(25); // wider than the slider goes
    box->setEdge(1, edge, false);
    QCOMPARE(button("EdgeWidth")->text(), QStringLiteral("25"));
    QSignalSpy spy(box, &EdgeToolBox::edgeChange);
    tap("EdgeWidth");
    QTRY_VERIFY(box->sliderIsShown());
    box->hideEdgeSliderMenu();
    QVERIFY(spy.isEmpty());
    tap("EdgeWidth");
    QTRY_VERIFY(box->sliderIsShown());
    box->slider()->slider()->setValue(4);
    box->slider()->slider()->setValue(10);
    box->hideEdgeSliderMenu();
    QCOMPARE(spy.size(), 2);
    for (const QVariantList& preview : std::as_const(spy))
        QCOMPARE(preview.mid(2), (QVariantList{6, 0, 2}));
}

void tst_toolbox::edgeSliderIsFramedAllRound()
{
    EdgeSizeSlider slider(nullptr);
    slider.resize(slider.sizeHint());
    QImage picture(slider.size(), QImage::Format_ARGB32_Premultiplied);
    picture.fill(Qt::transparent);
    slider.render(&picture, QPoint(), QRegion(), QWidget::RenderFlags());
    const QPoint middle = picture.rect().center();
    for (const QPoint& edge : {QPoint(middle.x(), 1), QPoint(middle.x(), picture.height() - 2),
                               QPoint(1, middle.y()), QPoint(picture.width() - 2, middle.y())})
        QVERIFY2(qAlpha(picture.pixel(edge)) > 0, qPrintable(QString::number(edge.y())));
}

void tst_toolbox::edgeSliderClosesByATouchBeside()
{
    auto* box = show<EdgeToolBox>();
    box->setEdge(1, TEdge(), false);
    QSignalSpy spy(box, &EdgeToolBox::edgeChange);
    tap("EdgeWidth");
    QTRY_VERIFY(box->sliderIsShown());
    tap("Icon_EdgeOff"); // closes the slider and does not press a button
    QVERIFY(!box->sliderIsShown());
    QVERIFY(spy.isEmpty());
    tap("Icon_EdgeOff");
    QCOMPARE(spy.size(), 1);
}

// Without a compositor they would be black.
void tst_toolbox::edgeSliderHasNoCorners()
{
    auto* edge = show<EdgeToolBox>();
    edge->slider()->popup(QPoint(100, 100));
    QVERIFY(QTest::qWaitForWindowExposed(edge->slider(), PATIENCE_MS));
    QVERIFY(!edge->slider()->mask().contains(QPoint(0, 0)));
    QVERIFY(!edge->slider()->mask().contains(edge->slider()->rect().bottomRight()));
    QCOMPARE(edge->slider()->mask().boundingRect(), edge->slider()->rect());
    edge->hideEdgeSliderMenu();
}

// No line has a single word if another break avoids it.
void tst_toolbox::rangeOfMoveBreaksInTheMiddle()
{
    m_window->setStyleSheet(QStringLiteral(" * {font-family:'KST';}")); // as the window does
    const auto* box = show<RangeOfMoveText>();
    for (const char* family : {"KST", "DFHeiW5-A", "DejaVu Sans"}) {
        m_window->setStyleSheet(QStringLiteral(" * {font-family:'%1';}").arg(QLatin1String(family)));
        const auto labels = box->findChildren<QLabel*>();
        const auto found =
            std::find_if(labels.begin(), labels.end(), [](const QLabel* label) { return label->wordWrap(); });
        QVERIFY(found != labels.end());
        const QLabel& label = **found;
        QCOMPARE(label.text(), QStringLiteral("Range of move per 1 tap"));
        QTextLayout layout(label.text(), label.font());
        layout.beginLayout();
        QList<qreal> widths;
        for (QTextLine line = layout.createLine(); line.isValid(); line = layout.createLine()) {
            line.setLineWidth(label.contentsRect().width());
            widths.append(line.naturalTextWidth());
        }
        layout.endLayout();
        QCOMPARE(widths.size(), 2);
        QVERIFY2(widths.at(1) > widths.at(0) / 2, family);
        QVERIFY2(widths.at(0) <= label.contentsRect().width(), family);
    }
}

void tst_toolbox::edgeColorStates()
{
    auto* box = show<EdgeToolBox>();
    QSignalSpy spy(box, &EdgeToolBox::edgeChange);
    for (const int state : {0, 1, 2}) {
        box->getColorValue(QStringLiteral("#C80000"), state);
        const QVariantList arguments = spy.takeFirst();
        QCOMPARE(arguments.at(0).toInt(), 1);
        QCOMPARE(arguments.at(1).value<TEdge>().getEdgeColor(), std::string("#C80000"));
        QCOMPARE(arguments.mid(2), (QVariantList{7, state, 3}));
    }
    QCOMPARE(box->getColor(), QStringLiteral("#C80000"));
}

void tst_toolbox::textColorStates()
{
    auto* box = show<TextColorToolBox>();
    QSignalSpy spy(box, &TextColorToolBox::textColorChange);
    for (const int state : {0, 1, 2})
        box->getColorValue(QStringLiteral("#00C743"), state);
    QCOMPARE(spy, (QList<QVariantList>{{"#00C743", 4, 0}, {"#00C743", 4, 1}, {"#00C743", 4, 2}}));
    const QImage face = button("TextColor")->grab().toImage();
    QCOMPARE(face.pixelColor(25, 24), QColor("#00C743"));
}

void tst_toolbox::colorButtonText()
{
    QCOMPARE(ColorButton::getRgbaValue(QStringLiteral("#C80000")), QStringLiteral("rgba(200, 0, 0, 255)"));
    QCOMPARE(ColorButton::getRgbaValue(QStringLiteral("no colour")), QStringLiteral("rgba(0, 0, 0, 255)"));
    QCOMPARE(ColorButton::getRgbaValue(QString()), QStringLiteral("rgba(0, 0, 0, 255)"));
}

void tst_toolbox::disabledBoxesIgnoreTaps()
{
    auto* align = show<AlignToolBox>();
    auto* edge = show<EdgeToolBox>();
    QSignalSpy alignSpy(align, &AlignToolBox::alignChange);
    QSignalSpy edgeSpy(edge, &EdgeToolBox::edgeChange);
    align->setWidgetDisabled();
    edge->setWidgetDisabled();
    tap("Icon_AlignRight");
    tap("Icon_EdgeOn");
    QVERIFY(alignSpy.isEmpty() && edgeSpy.isEmpty());
    QCOMPARE(button("Icon_AlignLeft")->paintedState(), KSPushbutton::ButtonSelectedDisabled);
    QCOMPARE(button("Icon_AlignRight")->paintedState(), KSPushbutton::ButtonDisabled);
    edge->setWidgetEnabled();
    QCOMPARE(button("Icon_EdgeOff")->paintedState(), KSPushbutton::ButtonSelectedRest);
    QCOMPARE(button("Icon_EdgeOn")->paintedState(), KSPushbutton::ButtonRest);
}

void tst_toolbox::resetShowsANewBox()
{
    auto* bold = show<BoldToolBox>();
    auto* edge = show<EdgeToolBox>();
    tap("Icon_Bold");
    tap("Icon_EdgeOn");
    bold->resetInitializeStyle();
    edge->resetInitializeStyle();
    QVERIFY(!bold->isBoxEnabled() && !edge->isBoxEnabled());
    QCOMPARE(bold->getFontBold(), 0);
    QVERIFY(!edge->isEdgeOn());
    QCOMPARE(edge->getEdge().getEdgeWidth(), 2);
    QCOMPARE(edge->getColor(), QStringLiteral("#393939"));
}

void tst_toolbox::pressedLookOnly()
{
    auto* box = show<AlignToolBox>();
    QSignalSpy spy(box, &AlignToolBox::alignChange);
    KSPushbutton* right = button("Icon_AlignRight");
    const QPoint center = right->rect().center();
    QTest::touchEvent(right, m_environment->device).press(0, center, right);
    QCOMPARE(right->paintedState(), KSPushbutton::ButtonPressed);
    QVERIFY(spy.isEmpty());
    // A finger that slides off the button does not choose it.
    QTest::touchEvent(right, m_environment->device).move(0, center + QPoint(0, 200), right);
    QTest::touchEvent(right, m_environment->device).release(0, center + QPoint(0, 200), right);
    QCOMPARE(right->paintedState(), KSPushbutton::ButtonRest);
    QVERIFY(spy.isEmpty());
}

QTEST_MAIN(tst_toolbox)
#include "tst_toolbox.moc"
