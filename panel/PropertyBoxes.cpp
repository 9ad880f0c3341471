#include "panel/PropertyBoxes.h"

#include "document/FontStyle.h"
#include "document/TText.h"
#include "panel/AlignToolBox.h"
#include "panel/BoldToolBox.h"
#include "panel/EdgeToolBox.h"
#include "panel/FamilyToolBox.h"
#include "panel/ItalicToolBox.h"
#include "panel/KerningToolBox.h"
#include "panel/RangeOfMoveText.h"
#include "panel/ShadowToolBox.h"
#include "panel/SizeToolBox.h"
#include "panel/TextColorToolBox.h"
#include "panel/TextToolsPanel.h"
#include "panel/WorkingStyle.h"
#include "touchui/NewLayout.h"

#include <QHBoxLayout>
#include <QVBoxLayout>
#include <algorithm>
#include <memory>

namespace
{

constexpr int BOLD_ROW_SPACING = 24;
constexpr int LEFT_MARGIN = 40; // the panel starts below the tools bar, left of the window's separator
constexpr int BLOCK_SPACING = 60;

QHBoxLayout* newRow(const QList<QWidget*>& widgets)
{
    auto* row = newLayout<QHBoxLayout>();
    for (QWidget* widget : widgets)
        row->addWidget(widget);
    row->addStretch();
    return row;
}

// Returns whether all characters have the value of the first one.
template <typename Value>
bool isCommon(const TText& style, Value value)
{
    const auto& items = style.textItems();
    return std::all_of(items.begin(), items.end(),
                       [&](const TextStyle* item) { return value(*item) == value(*items.front()); });
}

bool isBold(const TextStyle& item)
{
    return item.isFontBold() != 0;
}

bool isItalic(const TextStyle& item)
{
    return item.isTextItalic() != 0;
}

// Returns the flag that all characters share; 0 when they differ.
template <typename Value>
int commonFlag(const TText& style, Value value)
{
    return isCommon(style, value) && value(*style.textItems().front()) ? 1 : 0;
}

void setEnabled(ToolBox* box, bool enabled)
{
    if (enabled)
        box->setWidgetEnabled();
    else
        box->setWidgetDisabled();
}

} // namespace

PropertyBoxes::PropertyBoxes(QWidget* panel)
    : family(new FamilyToolBox(panel))
    , size(new SizeToolBox(panel))
    , bold(new BoldToolBox(panel))
    , italic(new ItalicToolBox(panel))
    , edge(new EdgeToolBox(panel))
    , shadow(new ShadowToolBox(panel))
    , align(new AlignToolBox(panel))
    , kerning(new KerningToolBox(panel))
    , textColor(new TextColorToolBox(panel))
    , move(new RangeOfMoveText(panel))
{
}

QList<ToolBox*> PropertyBoxes::all() const
{
    return {family, size, bold, italic, edge, shadow, align, kerning, textColor, move};
}

QLayout* PropertyBoxes::createLayout() const
{
    auto* row = newLayout<QHBoxLayout>();
    row->addSpacing(LEFT_MARGIN);
    row->addLayout(createLeftBlock());
    row->addSpacing(BLOCK_SPACING);
    row->addLayout(createMiddleBlock());
    row->addSpacing(BLOCK_SPACING);
    row->addWidget(move);
    row->addStretch();
    return row;
}

QLayout* PropertyBoxes::createLeftBlock() const
{
    auto* block = newLayout<QVBoxLayout>();
    block->addLayout(newRow({family, textColor}));
    block->addSpacing(TextToolsPanel::ROW_SPACING);
    block->addLayout(newRow({size}));
    block->addSpacing(BOLD_ROW_SPACING);
    block->addLayout(newRow({bold, italic}));
    block->addStretch();
    return block;
}

QLayout* PropertyBoxes::createMiddleBlock() const
{
    auto* block = newLayout<QVBoxLayout>();
    block->addLayout(newRow({edge}));
    block->addSpacing(TextToolsPanel::ROW_SPACING);
    block->addLayout(newRow({shadow}));
    block->addSpacing(BOLD_ROW_SPACING);
    block->addLayout(newRow({kerning, align}));
    block->addStretch();
    return block;
}

void PropertyBoxes::show(const TText& style, bool edgePreview)
{
    const auto& items = style.textItems();
    const TextStyle& last = *items.back();
    const auto familyOf = [](const TextStyle& item) { return item.getFontFamily(); };
    family->setFontFamily(isCommon(style, familyOf) ? QString::fromStdString(familyOf(last)) : QString());
    QList<int> sizes;
    sizes.reserve(qsizetype(items.size()));
    for (const TextStyle* item : items)
        sizes.append(item->getFontSize());
    size->setFontSize(sizes);
    bold->setFontBold(commonFlag(style, isBold));
    italic->setFontItalic(commonFlag(style, isItalic));
    textColor->setColor(QString::fromStdString(last.getFontColor()));
    edge->setEdge(last.isTextEdge(), last.textEdge(), edgePreview);
    kerning->setKerning(int(WorkingStyle::kernings().indexOf(last.getTextKerning())));
    align->setAlign(style.getTextAlign());
    shadow->setShadow(style.getShadowStyle());
    m_shadowOffsets = *style.getTextShadow();
}

void PropertyBoxes::show(const FontStyle& style)
{
    family->setFontFamily(QString::fromStdString(style.getFamily()));
    size->setFontSize({style.getSize()});
    bold->setFontBold(style.getBold() == 0 ? 0 : 1);
    italic->setFontItalic(style.getItalic() == 0 ? 0 : 1);
    textColor->setColor(QString::fromStdString(style.getColor()));
    edge->setEdge(style.getEdge(), *style.getEdgePoint(), false);
    kerning->setKerning(int(WorkingStyle::kernings().indexOf(style.getKerning())));
    align->setAlign(style.getAlign());
    shadow->setShadow(style.getShadowStyle());
    m_shadowOffsets = *style.getShadowPoint();
}

TText PropertyBoxes::shownStyle(const QString& defaultFamily) const
{
    const QList<int>& kernings = WorkingStyle::kernings();
    auto item = std::make_unique<TextStyle>();
    const QString shownFamily = family->getFontFamily();
    item->setText(std::string());
    item->setFontFamily((shownFamily.isEmpty() ? defaultFamily : shownFamily).toStdString());
    item->setFontSize(size->getFontSize());
    item->setFontBold(bold->getFontBold());
    item->setIsTextItalic(italic->getFontItalic());
    item->setFontColor(textColor->getColor().toStdString());
    item->setIsTextEdge(edge->isEdgeOn() ? 1 : 0);
    item->setTextEdge(edge->getEdge());
    item->setTextKerning(kernings.value(kerning->getKerning(), kernings.at(KerningToolBox::NORMAL)));

    TText style;
    style.setText(std::string());
    style.setTextAlign(align->getAlign());
    style.setShadowStyle(shadow->getShadow());
    style.setTextShadow(m_shadowOffsets);
    style.setTextItems({item.release()});
    return style;
}

void PropertyBoxes::reset()
{
    m_shadowAndAlignAllowed = false;
    m_movingAllowed = false;
    for (ToolBox* box : all())
        box->resetInitializeStyle();
}

void PropertyBoxes::enable()
{
    for (ToolBox* box : QList<ToolBox*>{family, textColor, size, bold, italic, edge, kerning})
        box->setWidgetEnabled();
    applyAllowed();
}

void PropertyBoxes::disable()
{
    for (ToolBox* box : all())
        box->setWidgetDisabled();
}

void PropertyBoxes::allow(bool shadowAndAlign, bool moving)
{
    m_shadowAndAlignAllowed = shadowAndAlign;
    m_movingAllowed = moving;
    applyAllowed();
}

void PropertyBoxes::applyAllowed()
{
    setEnabled(shadow, m_shadowAndAlignAllowed);
    setEnabled(align, m_shadowAndAlignAllowed);
    setEnabled(move, m_movingAllowed);
}
