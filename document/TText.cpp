#include "document/TText.h"

#include "document/DocumentConstants.h"

#include <algorithm>

TText::TText()
    : m_textObjectID(0)
    , m_text(DEFAULT_TEXT)
    , m_x(-1.0f)
    , m_y(-1.0f)
    , m_z(-1.0f)
    , m_textAlign(-1)
    , m_shadowStyle(0)
{
}

TText::TText(const TText& other)
    : m_textObjectID(other.m_textObjectID)
    , m_text(other.m_text)
    , m_x(other.m_x)
    , m_y(other.m_y)
    , m_z(other.m_z)
    , m_textAlign(other.m_textAlign)
    , m_shadowStyle(other.m_shadowStyle)
    , m_textShadow(other.m_textShadow)
{
    assignTextItems(other.m_textItems);
}

TText& TText::operator=(const TText& other)
{
    if (this == &other)
        return *this;
    m_textObjectID = other.m_textObjectID;
    m_text = other.m_text;
    m_x = other.m_x;
    m_y = other.m_y;
    m_z = other.m_z;
    m_textAlign = other.m_textAlign;
    m_shadowStyle = other.m_shadowStyle;
    m_textShadow = other.m_textShadow;
    assignTextItems(other.m_textItems);
    return *this;
}

TText::~TText()
{
    releaseVectorTextStyle();
}

// Overwrites the runs that are there already, which is cheaper than new ones.
void TText::assignTextItems(const std::vector<TextStyle*>& items)
{
    m_textItems.reserve(items.size());
    size_t count = 0;
    for (const TextStyle* item : items) {
        if (!item)
            continue;
        if (count == m_textItems.size())
            m_textItems.push_back(new TextStyle(*item));
        else if (m_textItems[count])
            *m_textItems[count] = *item;
        else
            m_textItems[count] = new TextStyle(*item);
        ++count;
    }
    for (size_t i = count; i < m_textItems.size(); ++i)
        delete m_textItems[i];
    m_textItems.resize(count);
}

void TText::releaseVectorTextStyle()
{
    for (TextStyle*& item : m_textItems) {
        delete item;
        item = nullptr;
    }
    m_textItems.clear();
}

bool TText::XYZvalueIsTheSame(const TText& other) const
{
    return m_x == other.m_x && m_y == other.m_y && m_z == other.m_z;
}

bool TText::shadowIsTheSame(const TText& other) const
{
    if (m_shadowStyle != other.m_shadowStyle)
        return false;
    return m_shadowStyle < 1 || m_textShadow == other.m_textShadow;
}

bool TText::textItemsIsTheSame(const TText& other) const
{
    return std::equal(m_textItems.begin(), m_textItems.end(), other.m_textItems.begin(),
                      other.m_textItems.end(),
                      [](const TextStyle* a, const TextStyle* b) { return a == b || (a && b && *a == *b); });
}

bool TText::operator==(const TText& other) const
{
    if (this == &other)
        return true;
    return XYZvalueIsTheSame(other) && m_textObjectID == other.m_textObjectID && m_text == other.m_text &&
           m_textAlign == other.m_textAlign && shadowIsTheSame(other) && textItemsIsTheSame(other);
}
