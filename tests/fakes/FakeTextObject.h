#pragma once

#include "canvas/CaretGeometry.h"
#include "canvas/ITextObjectListener.h"
#include "canvas/ITextSurface.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextObjectConstants.h"
#include "canvas/TextObjectParts.h"
#include "canvas/TextPlacement.h"

#include <QGraphicsTextItem>
#include <QStringList>
#include <QTextCursor>
#include <QTextDocument>

// Replaces the item, the scene and Qt's event handling in tests of the units of a text object. Keeps the
// state that the item would keep, and a list of the reports by name.
class FakeTextObject : public ITextSurface, public ITextObjectListener
{
public:
    FakeTextObject() { text.setPos(300.0, 200.0); }

    TextObjectParts parts() { return {*text.document(), styles, carets, placement, *this, *this}; }

    QTextCursor selection() const override { return text.textCursor(); }
    void select(const QTextCursor& cursor) override { text.setTextCursor(cursor); }
    int getFocusFlag() const override { return focusFlag; }
    void setFocusFlag(int flag) override { focusFlag = flag; }
    bool isWritable() const override { return writable; }
    void setWritable(bool on) override { writable = on; }
    void takeFocus() override { focused = true; }
    void giveUpFocus() override { focused = false; }
    double canvasRatio() const override { return TextObjectConstants::SCENEPERCENTAGE; }
    void handleByTextItem(QEvent::Type type, QEvent&) override { handled.append(type); }
    void announceGeometryChange() override {}
    void layoutChanged() override {}
    void parentFollows() override {}
    void repaint() override {}
    void repaintBlock(int) override {}
    void blockChanged(int) override {}
    void showShadow(const TShadow&) override {}

    void contentsEdited(TText&, TText&, TText&, TText&) override { reports.append("edited"); }
    void objectMoved(QPointF from, QPointF to) override
    {
        reports.append("moved");
        movedBy = to - from;
    }
    void styleShown(TText&) override { reports.append("style"); }
    void selectionModeChanged(bool shadowAndAlign, bool move) override
    {
        reports.append(QStringLiteral("mode %1%2").arg(int(shadowAndAlign)).arg(int(move)));
    }
    void objectSelected() override { reports.append("selected"); }
    void familyReplaced(const QString&) override { reports.append("family"); }
    void textTyped() override { reports.append("typed"); }
    void objectPressed() override { reports.append("pressed"); }
    void editingBegins() override { reports.append("editing"); }
    void keyboardWanted(bool wanted) override { reports.append(wanted ? "keyboard" : "no keyboard"); }

    QGraphicsTextItem text;
    StyleDocument styles;
    CaretGeometry carets{*text.document()};
    TextPlacement placement{text};
    int focusFlag = TextObjectConstants::FocusNone;
    bool writable = false;
    bool focused = false;
    QPointF movedBy;
    QList<QEvent::Type> handled;
    QStringList reports;
};
