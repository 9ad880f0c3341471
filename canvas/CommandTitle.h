#pragma once

#include <string>

class CanvasScene;

// The title that an undo command of the canvas was made for. A look around at a clean undo stack is no step
// of its own, so the canvas may show another title when the command is done again; objects of that one have
// the same numbers and are none of the command's. GUI thread only.
class CommandTitle
{
public:
    // The title that is shown now. The scene must outlive this object.
    explicit CommandTitle(const CanvasScene& scene);

    bool isShown() const;

private:
    static std::string pathOf(const CanvasScene& scene);

    const CanvasScene& m_scene;
    std::string m_path; // empty: no title
};
