#include "panel/TextToolsPanel.h"

#include "canvas/TextObjectConstants.h"
#include "panel/AlignToolBox.h"
#include "panel/BoldToolBox.h"
#include "panel/ColorPalette.h"
#include "panel/EdgeToolBox.h"
#include "panel/FamilyToolBox.h"
#include "panel/ItalicToolBox.h"
#include "panel/KerningToolBox.h"
#include "panel/RangeOfMoveText.h"
#include "panel/ShadowToolBox.h"
#include "panel/SizeToolBox.h"
#include "panel/TextColorToolBox.h"
#include "panel/TextToolsLog.h"

#include <utility>

const QString TextToolsPanel::EMPTY;
const QString TextToolsPanel::USELESS_STR;
const QString TextToolsPanel::FONT_DEFAULT_COLOR = QStringLiteral("#FFFFFF");
const QString TextToolsPanel::SHADOW_DEFAULT_COLOR = QString::fromLatin1(WorkingStyle::SHADOW_COLOR);

namespace
{

constexpr int COMMITTED = TextObjectConstants::CommittedChange;
const char DEFAULT_FAMILY[] = "KST";
const char CHINESE_FAMILY[] = "DFHeiW5-A";

QString familyOf(SystemSetupDef::emInformationModel model, SystemSetupDef::emInputLanguageType language)
{
    if (model == SystemSetupDef::emInformationModelChina)
        return QString::fromLatin1(CHINESE_FAMILY);
    switch (language) {
    case SystemSetupDef::emInputLanguageChineseSimplified:
    case SystemSetupDef::emInputLanguageChineseMixed:
        return QString::fromLatin1(CHINESE_FAMILY);
    case SystemSetupDef::emInputLanguageKorean:
        return QStringLiteral("YDGothic 100 Pro");
    case SystemSetupDef::emInputLanguageJapanese:
        return QStringLiteral("KST Japanese Pro");
    default:
        return QString::fromLatin1(DEFAULT_FAMILY);
    }
}

} // namespace

TextToolsPanel::TextToolsPanel(QWidget* parent)
    : QWidget(parent), m_boxes(this), m_palette(this), m_defaultFamily(QString::fromLatin1(DEFAULT_FAMILY))
{
    setFocusPolicy(Qt::NoFocus);
    setLayout(m_boxes.createLayout());
    createConnection();
    initTextToolsPanel();
}

TextToolsPanel::~TextToolsPanel() = default;

void TextToolsPanel::createConnection()
{
    connect(m_boxes.family, &FamilyToolBox::familyChange, this, &TextToolsPanel::changeFamily);
    connect(m_boxes.size, &SizeToolBox::sizeChange, this, &TextToolsPanel::changeSize);
    connect(m_boxes.bold, &BoldToolBox::boldChange, this, &TextToolsPanel::changeBold);
    connect(m_boxes.italic, &ItalicToolBox::italicChange, this, &TextToolsPanel::changeItalic);
    connect(m_boxes.textColor, &TextColorToolBox::textColorChange, this, &TextToolsPanel::changeTextColor);
    connect(m_boxes.edge, &EdgeToolBox::edgeChange, this, &TextToolsPanel::changeEdge);
    connect(m_boxes.align, &AlignToolBox::alignChange, this, &TextToolsPanel::changeAlign);
    connect(m_boxes.kerning, &KerningToolBox::kerningChange, this, &TextToolsPanel::changeKerning);
    connect(m_boxes.shadow, &ShadowToolBox::shadowChange, this, &TextToolsPanel::changeShadow);
    connect(m_boxes.move, &RangeOfMoveText::moveRangeChanged, this, &TextToolsPanel::changeMoveRange);

    connect(m_boxes.textColor, &TextColorToolBox::clicked, this, &TextToolsPanel::showFontColorPalette);
    connect(m_boxes.edge, &EdgeToolBox::clicked, this, &TextToolsPanel::showEdgeColorPalette);
    connect(m_palette.widget(), &ColorPalette::sendColorValue, this, &TextToolsPanel::getColorValue);
    connect(this, &TextToolsPanel::sendTitlerWindowRect, m_palette.widget(),
            &ColorPalette::setTitlerWindowRect);

    connect(m_boxes.size, &SizeToolBox::signalSizeToolBoxEditDone, this,
            &TextToolsPanel::signalNotifyEditAreaSizeToolBoxEditDone);
    connect(m_boxes.size, &SizeToolBox::signalShowSizeComboxList, this,
            &TextToolsPanel::signalShowFontSizeComboxList);
    connect(m_boxes.family, &FamilyToolBox::signalShowComboxList, this,
            &TextToolsPanel::slotShowFontFamilyComboxList);
    connect(m_boxes.edge, &EdgeToolBox::signalShowEdgeSlider, this, &TextToolsPanel::signalShowEdgeSlider);
    for (const ToolBox* box : m_boxes.all()) {
        connect(box, &ToolBox::signalClearSizeBoxLineEditFocus, this,
                &TextToolsPanel::slotClearSizeBoxLineEditFocus);
    }
}

void TextToolsPanel::setSignalValue(bool enabled)
{
    m_changesPass = enabled;
}

void TextToolsPanel::setModuleInfo(SystemSetupDef::emInformationModel model)
{
    m_model = model;
    if (model == SystemSetupDef::emInformationModelChina)
        m_defaultFamily = QString::fromLatin1(CHINESE_FAMILY);
}

// While nothing is selected the panel shows the style of a new text, whose family depends on the language.
void TextToolsPanel::displayInputLanguage(SystemSetupDef::emInputLanguageType language)
{
    const QString before = std::exchange(m_defaultFamily, familyOf(m_model, language));
    if (m_defaultFamily != before && !m_boxes.family->isBoxEnabled())
        m_boxes.family->setFontFamily(m_defaultFamily);
}

void TextToolsPanel::translateText()
{
    for (ToolBox* box : m_boxes.all())
        box->translateText();
    m_palette.widget()->translateText();
}

bool TextToolsPanel::colorPaletteIsShown() const
{
    return m_palette.widget()->isVisible();
}

void TextToolsPanel::showDialogMaskWidget(bool show)
{
    m_palette.widget()->showDialogMask(show);
}

void TextToolsPanel::showMessageMaskWidget(bool show)
{
    m_palette.widget()->showMessageMask(show);
}

bool TextToolsPanel::edgeSliderIsShown() const
{
    return m_boxes.edge->sliderIsShown();
}

void TextToolsPanel::hideEdgeSlider()
{
    m_boxes.edge->hideEdgeSliderMenu();
}

void TextToolsPanel::hideFontFamilyComboxList()
{
    m_boxes.family->hideComboxList();
}

void TextToolsPanel::hideFontSizeComboxList()
{
    m_boxes.size->hideComboxList();
}

void TextToolsPanel::titlerWindowRectSlot(QRect rect)
{
    m_titlerWindowRect = rect;
    Q_EMIT sendTitlerWindowRect(rect);
}

void TextToolsPanel::slotImportNewFontFamlies(QString file)
{
    m_boxes.family->importFontFamilyNotify(file);
}

void TextToolsPanel::modifyFontFamilyComboxItem(bool isAllItems)
{
    m_boxes.family->modifyComboxItem(isAllItems);
}

void TextToolsPanel::slotCanvasSceneMouseTouched()
{
    m_boxes.edge->hideEdgeSliderMenu();
}

void TextToolsPanel::slotHideColorPaletteWhenCloseSoftWare()
{
    m_palette.cancel();
}

void TextToolsPanel::slotEndPreview()
{
    m_palette.cancel();
    hideEdgeSlider();
}

void TextToolsPanel::slotClearSizeBoxLineEditFocus(bool clear)
{
    m_boxes.size->clearFocusOfSizeBoxLineEdit(clear);
}

void TextToolsPanel::slotShowFontFamilyComboxList(bool shown)
{
    Q_EMIT signalShowFontFamilyComboxList(shown);
}

void TextToolsPanel::slotAbsoluteShowCanvasMenu(bool shown)
{
    m_boxes.size->clearFocusOfSizeBoxLineEdit(shown);
}

// The change path: an action in a tool box changes the working copy and is sent to the canvas

// Carries out a change of any property. An empty log line is not written. A copy is sent, since the receivers
// may cause the working copy to be replaced.
template <typename Edit>
void TextToolsPanel::change(const std::wstring& log, int id, int undoFlag, Edit edit)
{
    if (!m_style.record())
        return;
    m_palette.cancelUnlessAnswering();
    TextToolsLog::write(log);
    if (!m_changesPass)
        return;
    edit();
    TText copy(*m_style.record());
    Q_EMIT textStyleChange(&copy, id, undoFlag);
    // The style is stored for the next run.
    if (undoFlag == COMMITTED && id != TextObjectConstants::PropertyPosition && m_style.record() &&
        !m_style.record()->textItems().empty())
        m_controller.setLastTextStyle(m_style.fontStyle());
}

void TextToolsPanel::changeFamily(QString family, int id)
{
    change(TextToolsLog::family(family), id, COMMITTED, [&] { m_style.setFamily(family); });
}

void TextToolsPanel::changeSize(QList<int> sizes, int id)
{
    if (!sizes.isEmpty())
        change(TextToolsLog::size(sizes.constLast()), id, COMMITTED, [&] { m_style.setSizes(sizes); });
}

void TextToolsPanel::changeBold(int bold, int id)
{
    change(TextToolsLog::bold(bold), id, COMMITTED, [&] { m_style.setBold(bold); });
}

void TextToolsPanel::changeItalic(int italic, int id)
{
    change(TextToolsLog::italic(italic), id, COMMITTED, [&] { m_style.setItalic(italic); });
}

void TextToolsPanel::changeTextColor(QString color, int id, int state)
{
    change(TextToolsLog::color(color), id, state, [&] {
        if (state == ColorPalette::CANCEL)
            m_style.setColors(m_palette.savedColors());
        else
            m_style.setColor(color);
    });
}

void TextToolsPanel::changeEdge(int on, TEdge edge, int id, int undoFlag, int kind)
{
    change(TextToolsLog::edge(on, edge, undoFlag, kind), id, undoFlag, [&] {
        m_edgePreview = id == TextObjectConstants::PropertyEdgeWidthPreview;
        editEdge(on, edge, undoFlag, kind);
    });
    m_edgePreview = false;
}

// Changes only the property of the edge that kind names; the others may differ between characters.
void TextToolsPanel::editEdge(int on, const TEdge& edge, int undoFlag, int kind)
{
    if (undoFlag == ColorPalette::CANCEL) {
        m_style.setEdgeColors(m_palette.savedColors());
        return;
    }
    switch (kind) {
    case EdgeToolBox::SWITCH:
        m_style.setEdge(on);
        break;
    case EdgeToolBox::WIDTH:
        m_style.setEdgeWidth(edge.getEdgeWidth());
        break;
    case EdgeToolBox::COLOR:
        m_style.setEdgeColor(QString::fromStdString(edge.getEdgeColor()));
        break;
    default:
        break;
    }
}

void TextToolsPanel::changeShadow(int style, int id)
{
    if (style < 0 || style >= WorkingStyle::shadows().size())
        return;
    change(TextToolsLog::shadow(), id, COMMITTED, [&] {
        m_style.setShadow(style);
        m_boxes.setShadowOffsets(WorkingStyle::shadows().at(style));
    });
}

void TextToolsPanel::changeAlign(int align, int id)
{
    change(TextToolsLog::align(), id, COMMITTED, [&] { m_style.setAlign(align); });
}

void TextToolsPanel::changeKerning(int index, int id)
{
    const QList<int>& kernings = WorkingStyle::kernings();
    if (index < KerningToolBox::DOUBLESMALL || index >= kernings.size())
        return;
    change(TextToolsLog::kerning(), id, COMMITTED, [&] { m_style.setKerning(kernings.at(index)); });
}

void TextToolsPanel::changeMoveRange(int range, int direction, int id)
{
    const float distance = float(range);
    change(TextToolsLog::move(range, direction), id, COMMITTED, [&] {
        switch (direction) {
        case RangeOfMoveText::UPBUTTON_INDEX:
            m_style.moveBy(0.0F, -distance);
            break;
        case RangeOfMoveText::RIGHTBUTTON_INDEX:
            m_style.moveBy(distance, 0.0F);
            break;
        case RangeOfMoveText::DOWNBUTTON_INDEX:
            m_style.moveBy(0.0F, distance);
            break;
        default:
            m_style.moveBy(-distance, 0.0F);
            break;
        }
    });
}

// The palette

void TextToolsPanel::showFontColorPalette()
{
    showPalette(PanelPalette::TEXT_COLOR_OWNER, m_boxes.textColor->getColor());
}

void TextToolsPanel::showEdgeColorPalette()
{
    showPalette(PanelPalette::EDGE_COLOR_OWNER, m_boxes.edge->getColor());
}

void TextToolsPanel::showPalette(PanelPalette::Owner owner, const QString& color)
{
    m_boxes.size->clearFocusOfSizeBoxLineEdit(true);
    if (!m_palette.open(owner, color, m_titlerWindowRect.topLeft()))
        return;
    m_palette.setSavedColors(owner == PanelPalette::EDGE_COLOR_OWNER ? m_style.edgeColors()
                                                                     : m_style.colors());
}

void TextToolsPanel::getColorValue(QString color, int state)
{
    const PanelPalette::Answer answer(m_palette);
    switch (m_palette.owner()) {
    case PanelPalette::TEXT_COLOR_OWNER:
        m_boxes.textColor->getColorValue(color, state);
        break;
    case PanelPalette::EDGE_COLOR_OWNER:
        m_boxes.edge->getColorValue(color, state);
        break;
    case PanelPalette::NO_OWNER:
        break;
    }
}

// The reverse path: the selection on the canvas is shown in the tool boxes, and nothing is sent back

void TextToolsPanel::updateTextStyle(TText* style)
{
    if (!style || style->textItems().empty())
        return;
    m_palette.cancelUnlessAnswering();
    m_changesPass = false;
    m_style.set(*style);
    m_boxes.show(*m_style.record(), m_edgePreview);
    m_boxes.enable();
    m_changesPass = true;
}

void TextToolsPanel::changeFontPropertyBtnStatus(bool enabled)
{
    if (enabled) {
        m_boxes.enable();
    } else {
        m_palette.cancel();
        m_boxes.disable();
    }
}

void TextToolsPanel::selectionModeForShadowAndAlign(bool shadowAlign, bool move)
{
    m_boxes.allow(shadowAlign, move);
}

void TextToolsPanel::initTextToolsPanel()
{
    slotEndPreview();
    hideFontFamilyComboxList();
    hideFontSizeComboxList();
    m_boxes.size->clearFocusOfSizeBoxLineEdit(true);
    m_changesPass = false;
    m_style.clear();
    m_palette.forget();
    m_boxes.reset();
    m_boxes.show(m_controller.getLastTextStyle());
    m_boxes.disable();
}

void TextToolsPanel::slotBeginNewTextItem()
{
    slotEndPreview();
    TText style = m_boxes.shownStyle(m_defaultFamily);
    Q_EMIT signalUpdateCurrentTextProperty(style);
}
