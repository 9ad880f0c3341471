#include "document/FontStyle.h"

#include "document/DocumentConstants.h"

FontStyle::FontStyle()
    : m_size(96)
    , m_bold(0)
    , m_italic(0)
    , m_shadowStyle(0)
    , m_edge(0)
    , m_kerning(100)
    , m_align(-1)
    , m_family(DEFAULT_FONT_FAMILY)
    , m_color(DEFAULT_FONT_CORLOR)
{
}
