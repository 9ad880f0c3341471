#pragma once

class CaretGeometry;
class ITextObjectListener;
class ITextSurface;
class QTextDocument;
class StyleDocument;
class TextPlacement;

// What the units of one text object work on. All parts belong to the object and outlive its units.
struct TextObjectParts {
    QTextDocument& document;
    StyleDocument& styles;
    CaretGeometry& carets;
    TextPlacement& placement;
    ITextSurface& surface;
    ITextObjectListener& listener;
};
