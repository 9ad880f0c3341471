#pragma once

// Returns a new layout, such as QHBoxLayout, without margins. The caller must add it to a widget or to
// another layout, which then owns it.
template <typename Layout>
Layout* newLayout(int spacing = 0)
{
    auto* layout = new Layout;
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(spacing);
    return layout;
}
