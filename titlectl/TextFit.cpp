#include "titlectl/TextFit.h"

#include "canvas/GraphicsText.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextObjectConstants.h"
#include "document/TText.h"
#include "document/TextStyle.h"

#include <QRectF>
#include <algorithm>
#include <cmath>
#include <memory>
#include <vector>

using namespace TextObjectConstants;

namespace
{

constexpr double RASTER_RATIO = 1.0;

std::unique_ptr<GraphicsText> laidOut(const TText& text, double ratio, bool isBig)
{
    TText copy = text;
    auto item = std::make_unique<GraphicsText>(&copy, 0);
    item->setRadio(ratio, isBig);
    item->initShowText();
    return item;
}

// The sizes of a text as they are drawn, and texts with smaller ones.
class SizeScale
{
public:
    explicit SizeScale(const TText& text)
    {
        for (const TextStyle* style : text.textItems())
            m_sizes.push_back(std::clamp(style->getFontSize(), 1, MAXIMUM_FONT_SIZE));
        if (m_sizes.empty())
            m_sizes.push_back(DEFAULT_MINIMUM_SIZE);
    }

    // A step is the size of the largest character.
    int largest() const { return *std::max_element(m_sizes.begin(), m_sizes.end()); }
    // Returns the lowest step at which no character is smaller than the size.
    int lowestStep(int smallest) const
    {
        const int least = *std::min_element(m_sizes.begin(), m_sizes.end());
        return (smallest * largest() + least - 1) / least;
    }

    void apply(TText& text, int step) const
    {
        const std::vector<TextStyle*>& items = text.textItems();
        const int whole = largest();
        for (std::size_t i = 0; i < items.size(); ++i)
            items[i]->setFontSize(m_sizes[i] * step / whole);
    }

private:
    std::vector<int> m_sizes;
};

} // namespace

double TextFit::inkWidthIn(const TText& text, double ratio, bool isBig)
{
    const double width = laidOut(text, ratio, isBig)->inkRect().width();
    if (width <= 0.0)
        return 0.0;
    // Ink that begins within a pixel touches one more.
    return (std::ceil(width) + 1.0) * SCENEPERCENTAGE / ratio;
}

double TextFit::inkWidth(const TText& text)
{
    // Font sizes are rounded to whole pixels, so that neither is always the wider one.
    return std::max(inkWidthIn(text, SCENEPERCENTAGE, false), inkWidthIn(text, RASTER_RATIO, true));
}

bool TextFit::shrink(TText& text, const TemplateFields::Fit& fit)
{
    const auto isFitting = [&] { return inkWidth(text) <= fit.width; };
    if (isFitting())
        return true;
    const SizeScale scale(text);
    int high = scale.largest(); // does not fit
    int low = scale.lowestStep(fit.smallest);
    if (low >= high)
        return false;
    scale.apply(text, low);
    bool fits = isFitting();
    if (fits) {
        while (high - low > 1) {
            const int middle = (low + high) / 2;
            scale.apply(text, middle);
            (isFitting() ? low : high) = middle;
        }
        scale.apply(text, low);
    }
    // The shadow follows the size, as when the size is changed on the canvas.
    StyleDocument::setItemShadowInfo(text);
    return fits;
}

double TextFit::boxWidth(const TText& text)
{
    return laidOut(text, SCENEPERCENTAGE, false)->layoutRect().width();
}

void TextFit::keepAlignment(TText& text, const TText& before)
{
    const int align = before.getTextAlign();
    if (align != 0 && align != 1)
        return;
    const double shift = (boxWidth(before) - boxWidth(text)) * (align == 0 ? CENTERPERCNTAGE : 1.0);
    text.setXValue(float(before.getXValue() + shift));
}
