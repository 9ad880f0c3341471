#pragma once

// Makes a layout without margins whose items touch each other, or are so many pixels apart. It becomes a
// widget's or a layout's own when it is given to it.
template <typename Layout>
Layout* newLayout(int spacing = 0)
{
    auto* layout = new Layout;
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(spacing);
    return layout;
}
