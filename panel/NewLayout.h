#pragma once

// Makes a layout without margins and gaps, of the Qt class given.
template <typename Layout>
Layout* newLayout()
{
    auto* layout = new Layout;
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    return layout;
}
