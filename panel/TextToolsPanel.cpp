// Building, layout and wiring of the panel, and what is only passed on.
#include "panel/TextToolsPanel.h"

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
#include "touchui/TightLayout.h"

#include <QHBoxLayout>
#include <QVBoxLayout>

#include <utility>

const QString TextToolsPanel::EMPTY;
const QString TextToolsPanel::USELESS_STR;
const QString TextToolsPanel::FONT_DEFAULT_COLOR = QStringLiteral("#FFFFFF");
const QString TextToolsPanel::SHADOW_DEFAULT_COLOR = QStringLiteral("#000000");

namespace
{

constexpr int BOLD_ROW_SPACING = 24;
constexpr int LEFT_MARGIN = 40; // the panel begins under the tools bar, left of the window's separator
constexpr int BLOCK_SPACING = 60;
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

QHBoxLayout* newRow(const QList<QWidget*>& widgets)
{
    auto* row = newLayout<QHBoxLayout>(TextToolsPanel::TEXTTOOL_LAYOUT_SPACING);
    for (QWidget* widget : widgets)
        row->addWidget(widget);
    row->addStretch();
    return row;
}

} // namespace

TextToolsPanel::TextToolsPanel(QWidget* parent)
    : QWidget(parent), m_defaultFamily(QString::fromLatin1(DEFAULT_FAMILY))
{
    setFocusPolicy(Qt::NoFocus);
    createToolBoxes();
    createLayout();
    createConnection();
    initTextToolsPanel();
}

TextToolsPanel::~TextToolsPanel() = default;

void TextToolsPanel::createToolBoxes()
{
    m_family = new FamilyToolBox(this);
    m_size = new SizeToolBox(this);
    m_bold = new BoldToolBox(this);
    m_italic = new ItalicToolBox(this);
    m_edge = new EdgeToolBox(this);
    m_shadow = new ShadowToolBox(this);
    m_align = new AlignToolBox(this);
    m_kerning = new KerningToolBox(this);
    m_textColor = new TextColorToolBox(this);
    m_move = new RangeOfMoveText(this);
    m_palette = new ColorPalette(this);
}

QList<ToolBox*> TextToolsPanel::boxes() const
{
    return {m_family, m_size, m_bold, m_italic, m_edge, m_shadow, m_align, m_kerning, m_textColor, m_move};
}

void TextToolsPanel::createLayout()
{
    auto* row = newLayout<QHBoxLayout>(TEXTTOOL_LAYOUT_SPACING);
    row->addSpacing(LEFT_MARGIN);
    row->addLayout(createLeftBlock());
    row->addSpacing(BLOCK_SPACING);
    row->addLayout(createMiddleBlock());
    row->addSpacing(BLOCK_SPACING);
    row->addWidget(m_move);
    row->addStretch();
    setLayout(row);
}

QLayout* TextToolsPanel::createLeftBlock()
{
    auto* block = newLayout<QVBoxLayout>(TEXTTOOL_LAYOUT_SPACING);
    block->addLayout(newRow({m_family, m_textColor}));
    block->addSpacing(ROW_SPACING);
    block->addLayout(newRow({m_size}));
    block->addSpacing(BOLD_ROW_SPACING);
    block->addLayout(newRow({m_bold, m_italic}));
    block->addStretch();
    return block;
}

QLayout* TextToolsPanel::createMiddleBlock()
{
    auto* block = newLayout<QVBoxLayout>(TEXTTOOL_LAYOUT_SPACING);
    block->addLayout(newRow({m_edge}));
    block->addSpacing(ROW_SPACING);
    block->addLayout(newRow({m_shadow}));
    block->addSpacing(BOLD_ROW_SPACING);
    block->addLayout(newRow({m_kerning, m_align}));
    block->addStretch();
    return block;
}

void TextToolsPanel::createConnection()
{
    connect(m_family, &FamilyToolBox::familyChange, this, &TextToolsPanel::changeFamily);
    connect(m_size, &SizeToolBox::sizeChange, this, &TextToolsPanel::changeSize);
    connect(m_bold, &BoldToolBox::boldChange, this, &TextToolsPanel::changeBold);
    connect(m_italic, &ItalicToolBox::italicChange, this, &TextToolsPanel::changeItalic);
    connect(m_textColor, &TextColorToolBox::textColorChange, this, &TextToolsPanel::changeTextColor);
    connect(m_edge, &EdgeToolBox::edgeChange, this, &TextToolsPanel::changeEdge);
    connect(m_align, &AlignToolBox::alignChange, this, &TextToolsPanel::changeAlign);
    connect(m_kerning, &KerningToolBox::kerningChange, this, &TextToolsPanel::changeKerning);
    connect(m_shadow, &ShadowToolBox::shadowChange, this, &TextToolsPanel::changeShadow);
    connect(m_move, &RangeOfMoveText::moveRangeChanged, this, &TextToolsPanel::changeMoveRange);

    connect(m_textColor, &TextColorToolBox::clicked, this, &TextToolsPanel::showFontColorPalette);
    connect(m_edge, &EdgeToolBox::clicked, this, &TextToolsPanel::showEdgeColorPalette);
    connect(m_palette, &ColorPalette::sendColorValue, this, &TextToolsPanel::getColorValue);
    connect(this, &TextToolsPanel::sendTitlerWindowRect, m_palette, &ColorPalette::setTitlerWindowRect);

    connect(m_size, &SizeToolBox::signalSizeToolBoxEditDone, this,
            &TextToolsPanel::signalNotifyEditAreaSizeToolBoxEditDone);
    connect(m_size, &SizeToolBox::signalShowSizeComboxList, this,
            &TextToolsPanel::signalShowFontSizeComboxList);
    connect(m_family, &FamilyToolBox::signalShowComboxList, this,
            &TextToolsPanel::slotShowFontFamilyComboxList);
    connect(m_edge, &EdgeToolBox::signalShowEdgeSlider, this, &TextToolsPanel::signalShowEdgeSlider);
    for (const ToolBox* box : boxes()) {
        connect(box, &ToolBox::signalClearSizeBoxLineEditFocus, this,
                &TextToolsPanel::slotClearSizeBoxLineEditFocus);
    }
}

// Index is the shadow style.
const QList<TShadow>& TextToolsPanel::initConstShadowValue()
{
    static const QList<TShadow> table = [] {
        const QPoint directions[] = {{0, 0}, {RIGHT_X, DOWN_Y}, {0, DOWN_Y}, {LEFT_X, DOWN_Y}};
        QList<TShadow> shadows;
        for (const QPoint& direction : directions) {
            TShadow shadow;
            shadow.setShadowColor(SHADOW_DEFAULT_COLOR.toStdString());
            shadow.setShadowDirectionX(direction.x());
            shadow.setShadowDirectionY(direction.y());
            shadows.append(shadow);
        }
        return shadows;
    }();
    return table;
}

// Percent of the font's own spacing; index is the level.
const QList<int>& TextToolsPanel::initConstKerningValue()
{
    static const QList<int> table{80, 90, 100, 110, 120};
    return table;
}

void TextToolsPanel::setSignalValue(bool enabled)
{
    m_enabledForChange = enabled ? 1 : 0;
}

void TextToolsPanel::setModuleInfo(SystemSetupDef::emInformationModel model)
{
    m_model = model;
    if (model == SystemSetupDef::emInformationModelChina)
        m_defaultFamily = QString::fromLatin1(CHINESE_FAMILY);
}

// With nothing selected the panel shows what a new text begins with, which a new language changes.
void TextToolsPanel::displayInputLanguage(SystemSetupDef::emInputLanguageType language)
{
    const QString before = std::exchange(m_defaultFamily, familyOf(m_model, language));
    if (m_defaultFamily != before && !m_family->isBoxEnabled())
        m_family->setFontFamily(m_defaultFamily);
}

void TextToolsPanel::translateText()
{
    for (ToolBox* box : boxes())
        box->translateText();
    m_palette->translateText();
}

bool TextToolsPanel::colorPaletteIsShown() const
{
    return m_palette->isVisible();
}

void TextToolsPanel::showDialogMaskWidget(bool show)
{
    m_palette->showDialogMask(show);
}

void TextToolsPanel::showMessageMaskWidget(bool show)
{
    m_palette->showMessageMask(show);
}

bool TextToolsPanel::edgeSliderIsShown() const
{
    return m_edge->sliderIsShown();
}

void TextToolsPanel::hideEdgeSlider()
{
    m_edge->hideEdgeSliderMenu();
}

void TextToolsPanel::hideFontFamilyComboxList()
{
    m_family->hideComboxList();
}

void TextToolsPanel::hideFontSizeComboxList()
{
    m_size->hideComboxList();
}

void TextToolsPanel::titlerWindowRectSlot(QRect rect)
{
    m_titlerWindowRect = rect;
    Q_EMIT sendTitlerWindowRect(rect);
}

void TextToolsPanel::slotImportNewFontFamlies(QString file)
{
    m_family->importFontFamilyNotify(file);
}

void TextToolsPanel::modifyFontFamilyComboxItem(bool isAllItems)
{
    m_family->modifyComboxItem(isAllItems);
}

void TextToolsPanel::slotCanvasSceneMouseTouched()
{
    m_edge->hideEdgeSliderMenu();
}

void TextToolsPanel::slotHideColorPaletteWhenCloseSoftWare()
{
    m_palette->reject();
}

void TextToolsPanel::slotEndPreview()
{
    m_palette->reject();
    hideEdgeSlider();
}

void TextToolsPanel::slotClearSizeBoxLineEditFocus(bool clear)
{
    m_size->clearFocusOfSizeBoxLineEdit(clear);
}

void TextToolsPanel::slotShowFontFamilyComboxList(bool shown)
{
    Q_EMIT signalShowFontFamilyComboxList(shown);
}

void TextToolsPanel::slotAbsoluteShowCanvasMenu(bool shown)
{
    m_size->clearFocusOfSizeBoxLineEdit(shown);
}
