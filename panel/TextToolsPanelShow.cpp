// The reverse path: what is selected on the canvas is shown in the tool boxes, and nothing is sent back.
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

namespace
{

constexpr int MIXED = -1;

} // namespace

void TextToolsPanel::updateTextStyle(TText* style)
{
    if (!style || style->textItems().empty())
        return;
    cancelPaletteOfOthers();
    m_enabledForChange = 0;
    m_style = std::make_unique<TText>(*style);
    setChildWidget();
    setChildWidgetEnabled();
    m_enabledForChange = 1;
}

void TextToolsPanel::setChildWidget()
{
    QString family;
    int bold = 0;
    int italic = 0;
    setDisplayedValueForMultiStyle(m_style.get(), &family, &bold, &italic);
    setChildWidgetValue(family, bold, italic);
}

// An empty family and -1 stand for characters that differ.
void TextToolsPanel::setDisplayedValueForMultiStyle(const TText* style, QString* family, int* bold,
                                                    int* italic) const
{
    const auto& items = style->textItems();
    const TextStyle& first = *items.front();
    *family = QString::fromStdString(first.getFontFamily());
    *bold = first.isFontBold();
    *italic = first.isTextItalic();
    for (const TextStyle* item : items) {
        if (item->getFontFamily() != first.getFontFamily())
            family->clear();
        if ((item->isFontBold() != 0) != (first.isFontBold() != 0))
            *bold = MIXED;
        if ((item->isTextItalic() != 0) != (first.isTextItalic() != 0))
            *italic = MIXED;
    }
}

void TextToolsPanel::setChildWidgetValue(const QString& family, int bold, int italic)
{
    const auto& items = m_style->textItems();
    const TextStyle& last = *items.back();
    m_mixedFamily = family.isEmpty();
    m_mixedBold = bold == MIXED;
    m_mixedItalic = italic == MIXED;

    m_family->setFontFamily(family);
    QList<int> sizes;
    sizes.reserve(qsizetype(items.size()));
    for (const TextStyle* item : items)
        sizes.append(item->getFontSize());
    m_size->setFontSize(sizes);
    m_bold->setFontBold(m_mixedBold || bold == 0 ? 0 : 1);
    m_italic->setFontItalic(m_mixedItalic || italic == 0 ? 0 : 1);
    m_textColor->setColor(QString::fromStdString(last.getFontColor()));
    m_edge->setEdge(last.isTextEdge(), last.textEdge(), m_edgePreview);
    m_kerning->setKerning(int(initConstKerningValue().indexOf(last.getTextKerning())));
    m_align->setAlign(m_style->getTextAlign());
    m_shadow->setShadow(m_style->getShadowStyle());
    m_workingShadow = *m_style->getTextShadow();
}

// Enabling

void TextToolsPanel::changeFontPropertyBtnStatus(bool enabled)
{
    if (enabled) {
        setChildWidgetEnabled();
    } else {
        m_palette->reject();
        setChildWidgetDisabled();
    }
}

void TextToolsPanel::selectionModeForShadowAndAlign(bool shadowAlign, bool move)
{
    m_alignEnabled = shadowAlign;
    m_moveEnabled = move;
    showSelectionMode();
}

void TextToolsPanel::setChildWidgetEnabled()
{
    for (ToolBox* box : QList<ToolBox*>{m_family, m_textColor, m_size, m_bold, m_italic, m_edge, m_kerning})
        box->setWidgetEnabled();
    showSelectionMode();
}

// Shadow and align apply to a whole text, moving to an object that is selected as one.
void TextToolsPanel::showSelectionMode()
{
    for (ToolBox* box : QList<ToolBox*>{m_shadow, m_align}) {
        if (m_alignEnabled) {
            box->setWidgetEnabled();
        } else {
            box->setWidgetDisabled();
        }
    }
    if (m_moveEnabled) {
        m_move->setWidgetEnabled();
    } else {
        m_move->setWidgetDisabled();
    }
}

void TextToolsPanel::setChildWidgetDisabled()
{
    for (ToolBox* box : boxes())
        box->setWidgetDisabled();
}

// Without a selection

void TextToolsPanel::initTextToolsPanel()
{
    slotEndPreview();
    hideFontFamilyComboxList();
    hideFontSizeComboxList();
    m_size->clearFocusOfSizeBoxLineEdit(true);
    m_enabledForChange = 0;
    m_style.reset();
    m_savedColors.clear();
    m_paletteOwner = NO_OWNER;
    m_alignEnabled = false;
    m_moveEnabled = false;
    for (ToolBox* box : boxes())
        box->resetInitializeStyle();
    showFontStyle(m_controller.getLastTextStyle());
}

void TextToolsPanel::showFontStyle(const FontStyle& style)
{
    m_family->setFontFamily(QString::fromStdString(style.getFamily()));
    m_size->setFontSize({style.getSize()});
    m_bold->setFontBold(style.getBold() == 0 ? 0 : 1);
    m_italic->setFontItalic(style.getItalic() == 0 ? 0 : 1);
    m_textColor->setColor(QString::fromStdString(style.getColor()));
    m_edge->setEdge(style.getEdge(), *style.getEdgePoint(), false);
    m_kerning->setKerning(int(initConstKerningValue().indexOf(style.getKerning())));
    m_align->setAlign(style.getAlign());
    m_shadow->setShadow(style.getShadowStyle());
    m_workingShadow = *style.getShadowPoint();
    setChildWidgetDisabled();
}

void TextToolsPanel::slotBeginNewTextItem()
{
    slotEndPreview();
    TText style = getTTextStyleForNew();
    Q_EMIT signalUpdateCurrentTextProperty(style);
}

// What the boxes show, as the style of one character.
TText TextToolsPanel::getTTextStyleForNew() const
{
    auto item = std::make_unique<TextStyle>();
    const QString family = m_family->getFontFamily();
    item->setText(std::string());
    item->setFontFamily((family.isEmpty() ? m_defaultFamily : family).toStdString());
    item->setFontSize(m_size->getFontSize());
    item->setFontBold(m_bold->getFontBold());
    item->setIsTextItalic(m_italic->getFontItalic());
    item->setFontColor(m_textColor->getColor().toStdString());
    item->setIsTextEdge(m_edge->isEdgeOn() ? 1 : 0);
    item->setTextEdge(m_edge->getEdge());
    item->setTextKerning(initConstKerningValue().value(m_kerning->getKerning(),
                                                       initConstKerningValue().at(KerningToolBox::NORMAL)));

    TText style;
    style.setText(std::string());
    style.setTextAlign(m_align->getAlign());
    style.setShadowStyle(m_shadow->getShadow());
    style.setTextShadow(m_workingShadow);
    style.setTextItems({item.release()});
    return style;
}
