// The change path: what the operator does in a tool box goes into the working copy and to the canvas.
#include "panel/TextToolsPanel.h"

#include "canvas/TextObjectConstants.h"
#include "panel/ColorPalette.h"
#include "panel/EdgeToolBox.h"
#include "panel/KerningToolBox.h"
#include "panel/RangeOfMoveText.h"
#include "panel/SizeToolBox.h"
#include "panel/TextColorToolBox.h"
#include "support/LogManager.h"
#include "touchui/KSInputContext.h"

#include <QScopedValueRollback>

namespace
{

constexpr wchar_t LOG_AREA[] = L"Text Property Area";
constexpr int OPERATION = 200;
constexpr int COMMITTED = 1;
constexpr QPoint PALETTE_PLACE(640, 350); // in the window

const wchar_t* directionWord(int direction)
{
    switch (direction) {
    case RangeOfMoveText::UPBUTTON_INDEX:
        return L"up";
    case RangeOfMoveText::RIGHTBUTTON_INDEX:
        return L"right";
    case RangeOfMoveText::DOWNBUTTON_INDEX:
        return L"down";
    default:
        return L"left";
    }
}

} // namespace

// Every change goes this way. An empty log line is left out. The copy lives during the call only, so that
// whoever shows the answer may replace the working copy meanwhile.
template <typename Edit>
void TextToolsPanel::change(const std::wstring& log, int id, int undoFlag, Edit edit)
{
    if (!m_style)
        return;
    cancelPaletteOfOthers();
    if (!log.empty())
        LOG_USER_OPERATE(LOG_AREA, OPERATION, log);
    if (m_enabledForChange != 1)
        return;
    edit(*m_style);
    TText copy(*m_style);
    Q_EMIT textStyleChange(&copy, id, undoFlag);
    if (undoFlag == COMMITTED && id != TextObjectConstants::PropertyPosition)
        rememberStyle();
}

template <typename Edit>
void TextToolsPanel::changeAllItems(const std::wstring& log, int id, int undoFlag, Edit edit)
{
    change(log, id, undoFlag, [&edit](TText& style) {
        for (TextStyle* item : style.textItems())
            edit(*item);
    });
}

void TextToolsPanel::changeFamily(QString family, int id)
{
    changeAllItems(L"Adjust Font Family to " + family.toStdWString(), id, COMMITTED,
                   [name = family.toStdString()](TextStyle& item) { item.setFontFamily(name); });
}

void TextToolsPanel::changeSize(QList<int> sizes, int id)
{
    if (sizes.isEmpty())
        return;
    change(L"Adjust Font Size to " + std::to_wstring(sizes.constLast()), id, COMMITTED,
           [&sizes](TText& style) {
               const auto& items = style.textItems();
               const qsizetype count = std::min(sizes.size(), qsizetype(items.size()));
               for (qsizetype i = 0; i < count; ++i)
                   items[size_t(i)]->setFontSize(sizes.at(i));
           });
}

void TextToolsPanel::changeBold(int bold, int id)
{
    changeAllItems(L"Adjust Bold to" + changeintValueToString(bold).toStdWString() + L"bold", id, COMMITTED,
                   [bold](TextStyle& item) { item.setFontBold(bold); });
}

void TextToolsPanel::changeItalic(int italic, int id)
{
    changeAllItems(L"Adjust Italic to" + changeintValueToString(italic).toStdWString() + L"Italic", id,
                   COMMITTED, [italic](TextStyle& item) { item.setIsTextItalic(italic); });
}

void TextToolsPanel::changeTextColor(QString color, int id, int state)
{
    const std::wstring log = L"Adjust Font Color to " + color.toStdWString();
    if (state != ColorPalette::CANCEL) {
        changeAllItems(log, id, state,
                       [name = color.toStdString()](TextStyle& item) { item.setFontColor(name); });
        return;
    }
    change(log, id, state, [this](TText& style) {
        const auto& items = style.textItems();
        const qsizetype count = std::min(m_savedColors.size(), qsizetype(items.size()));
        for (qsizetype i = 0; i < count; ++i)
            items[size_t(i)]->setFontColor(m_savedColors.at(i).toStdString());
    });
}

void TextToolsPanel::changeEdge(int on, TEdge edge, int id, int undoFlag, int kind)
{
    if (!m_style)
        return;
    cancelPaletteOfOthers();
    outPutUserLog(on, edge, undoFlag, kind);
    m_edgePreview = id == TextObjectConstants::PropertyEdgeWidthPreview;
    change(std::wstring(), id, undoFlag, [&](TText& style) {
        const auto& items = style.textItems();
        for (size_t i = 0; i < items.size(); ++i) {
            if (undoFlag != ColorPalette::CANCEL) {
                setEdgeValueForTText(*items[i], on, edge, kind);
            } else if (qsizetype(i) < m_savedColors.size()) {
                edge.setEdgeColor(m_savedColors.at(qsizetype(i)).toStdString());
                setEdgeValueForTText(*items[i], on, edge, EdgeToolBox::COLOR);
            }
        }
    });
    m_edgePreview = false;
}

// Characters keep the values of their edge that the change is not about.
void TextToolsPanel::setEdgeValueForTText(TextStyle& item, int on, const TEdge& edge, int kind)
{
    TEdge own = item.getTextEdge();
    switch (kind) {
    case EdgeToolBox::SWITCH:
        item.setIsTextEdge(on);
        break;
    case EdgeToolBox::WIDTH:
        own.setEdgeWidth(edge.getEdgeWidth());
        break;
    case EdgeToolBox::COLOR:
        own.setEdgeColor(edge.getEdgeColor());
        break;
    default:
        break;
    }
    item.setTextEdge(own);
}

// A drag of the slider is logged once, at its end.
void TextToolsPanel::outPutUserLog(int on, const TEdge& edge, int undoFlag, int kind) const
{
    std::wstring text;
    switch (kind) {
    case EdgeToolBox::SWITCH:
        text = L"Adjust Edge to " + changeintValueToString(on).toStdWString() + L"Edge";
        break;
    case EdgeToolBox::WIDTH:
        if (undoFlag != 0)
            text = L"Adjust Edge Width to " + std::to_wstring(edge.getEdgeWidth());
        break;
    case EdgeToolBox::COLOR:
        text = L"Adjust Edge Color to " + QString::fromStdString(edge.getEdgeColor()).toStdWString();
        break;
    default:
        break;
    }
    if (!text.empty())
        LOG_USER_OPERATE(LOG_AREA, OPERATION, text);
}

QString TextToolsPanel::changeintValueToString(int value)
{
    return value == 0 ? QStringLiteral(" without ") : QStringLiteral(" with ");
}

void TextToolsPanel::changeShadow(int style, int id)
{
    const QList<TShadow>& table = initConstShadowValue();
    if (style < 0 || style >= table.size())
        return;
    change(L"Adjust shadow ", id, COMMITTED, [&](TText& text) {
        m_workingShadow = table.at(style);
        text.setShadowStyle(style);
        text.setTextShadow(m_workingShadow);
    });
}

void TextToolsPanel::changeAlign(int align, int id)
{
    change(L"Adjust Alignment", id, COMMITTED, [align](TText& style) { style.setTextAlign(align); });
}

void TextToolsPanel::changeKerning(int index, int id)
{
    const QList<int>& table = initConstKerningValue();
    if (index < KerningToolBox::DOUBLESMALL || index >= table.size())
        return;
    changeAllItems(L"Adjust Space ", id, COMMITTED,
                   [kerning = table.at(index)](TextStyle& item) { item.setTextKerning(kerning); });
}

void TextToolsPanel::changeMoveRange(int range, int direction, int id)
{
    const std::wstring log =
        L"Move Text Object " + std::to_wstring(range) + L" px to the " + directionWord(direction);
    change(log, id, COMMITTED, [range, direction](TText& style) {
        const float distance = float(range);
        switch (direction) {
        case RangeOfMoveText::UPBUTTON_INDEX:
            style.setYValue(style.getYValue() - distance);
            break;
        case RangeOfMoveText::RIGHTBUTTON_INDEX:
            style.setXValue(style.getXValue() + distance);
            break;
        case RangeOfMoveText::DOWNBUTTON_INDEX:
            style.setYValue(style.getYValue() + distance);
            break;
        default:
            style.setXValue(style.getXValue() - distance);
            break;
        }
    });
}

// What the next run starts with.
void TextToolsPanel::rememberStyle() const
{
    if (!m_style || m_style->textItems().empty())
        return;
    const TextStyle& item = *m_style->textItems().front();
    FontStyle style;
    style.setFamily(item.getFontFamily());
    style.setSize(item.getFontSize());
    style.setColor(item.getFontColor());
    style.setBold(item.isFontBold());
    style.setItalic(item.isTextItalic());
    style.setKerning(item.getTextKerning());
    style.setEdge(item.isTextEdge());
    style.setEdgePoint(item.getTextEdge());
    style.setAlign(m_style->getTextAlign());
    style.setShadowStyle(m_style->getShadowStyle());
    style.setShadowPoint(*m_style->getTextShadow());
    m_controller.setLastTextStyle(style);
}

// The palette

void TextToolsPanel::showFontColorPalette()
{
    showPalette(TEXT_COLOR_OWNER, m_textColor->getColor());
}

void TextToolsPanel::showEdgeColorPalette()
{
    showPalette(EDGE_COLOR_OWNER, m_edge->getColor());
}

// A palette that is open for the other colour is cancelled by it first; one that is open for this colour
// keeps what it gives back.
void TextToolsPanel::showPalette(PaletteOwner owner, const QString& color)
{
    m_size->clearFocusOfSizeBoxLineEdit(true);
    if (m_palette->isVisible() && m_paletteOwner == owner)
        return;
    m_palette->reject();
    m_paletteOwner = owner;
    m_palette->setCurrentColor(color);
    m_palette->move(m_titlerWindowRect.topLeft() + PALETTE_PLACE);
    m_palette->show();
    if (KSInputContext* input = KSInputContext::instance())
        input->showMaskOnSoftKeyboard();
    saveColorList();
}

void TextToolsPanel::saveColorList()
{
    m_savedColors.clear();
    if (!m_style)
        return;
    for (const TextStyle* item : m_style->textItems()) {
        m_savedColors.append(QString::fromStdString(
            m_paletteOwner == EDGE_COLOR_OWNER ? item->textEdge().getEdgeColor() : item->getFontColor()));
    }
}

// A change by anything but the palette would take the previewed colour over.
void TextToolsPanel::cancelPaletteOfOthers()
{
    if (!m_paletteAnswers)
        m_palette->reject();
}

void TextToolsPanel::getColorValue(QString color, int state)
{
    const QScopedValueRollback answers(m_paletteAnswers, true);
    if (m_paletteOwner == TEXT_COLOR_OWNER) {
        m_textColor->getColorValue(color, state);
    } else if (m_paletteOwner == EDGE_COLOR_OWNER) {
        m_edge->getColorValue(color, state);
    }
}
