#pragma once

class CaretGeometry;
class ITextObjectListener;
class ITextSurface;
class QTextDocument;
class StyleDocument;
class TextPlacement;

// The parts of one text object that its units work on. They belong to the object and outlive its units.
struct TextObjectParts {
    QTextDocument& document;
    StyleDocument& styles;
    CaretGeometry& carets;
    TextPlacement& placement;
    ITextSurface& surface;
    ITextObjectListener& listener;
};
