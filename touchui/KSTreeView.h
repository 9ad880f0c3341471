#pragma once

#include "touchui/KSVIEW.h"
#include "touchui/KSViewStyle.h"
#include "touchui/TreeLoadingMarks.h"
#include "touchui/TreeTouch.h"

#include <QMap>
#include <QPersistentModelIndex>
#include <QStringList>
#include <QTreeView>

class CustomTreeDelegete;
class KSTreeModel;
class QEvent;
class QTouchEvent;

// A tree that is operated with one finger: a drag scrolls, a flick lets the list glide, a tap selects a row,
// expands or collapses it, or toggles its check box, and a hold of 700 ms requests that the row's name is
// edited. A touch on a gliding list only stops it. The mouse works in the same way.
//
// A tap on an enabled row makes it current and emits pressed() and clicked(); a hold emits only pressed().
// See TreeTouch, which also reports the hold. Positions are in viewport coordinates. Intended for a
// KSTreeModel; of other models only the standard roles are shown. GUI thread only.
class KSTreeView : public QTreeView
{
    Q_OBJECT
public:
    enum CheckBoxImage {
        OnRest,
        OnPressed,
        OnDisabled,
        OffRest,
        OffPressed,
        OffDisabled,
        PartialRest,
        PartialPressed,
        PartialDisabled
    };

    // Paths of the pictures in the order of CheckBoxImage.
    static QStringList s_checkBoxImagesPath;

    explicit KSTreeView(QWidget* parent = nullptr);

    void setModel(QAbstractItemModel* model) override;
    CustomTreeDelegete* treeDelegate() const { return m_delegate; }
    TreeTouch* touch() { return &m_touch; }

    // Returns the value that was set, or the default.
    QVariant getDesignAttribute(KSVIEW::enumDesignAttributeRole role) const;
    void setDesignAttribute(KSVIEW::enumDesignAttributeRole role, const QVariant& value);

    // Inserts rows into the model; returns false if it refuses.
    virtual bool insertRows(int row, int count, const QModelIndex& parent);
    virtual QRect getCheckBoxRect(const QModelIndex& index) const;
    virtual QRect getIndicatorRect(const QModelIndex& index) const;
    virtual CheckBoxImage getCheckBoxImageType(const QModelIndex& index) const;
    // step counts from 1 to 8; other values wrap around.
    virtual QString getLoadingImagePath(int step) const;
    // Toggles a cell that is checkable and enabled, and updates the rows below and above it.
    virtual void changeCheckState(const QModelIndex& index);
    virtual void changeParentsCheckState(const QModelIndex& index);
    // See TreeCheckStates.
    virtual void changeCheckStateByNumber(const QModelIndex& index, int number);
    virtual void changeChildrenCheckState(const QModelIndex& index, Qt::CheckState state);
    // Moves the current row directly behind a row of the same parent; returns false if that is not possible.
    virtual bool moveToSibling(QModelIndex sibling);
    virtual bool isTextElide(const QModelIndex& index) const;
    virtual bool isIndicatorPressed(const QModelIndex& index) const;
    virtual void drawOnEmptyArea(QPainter* painter);
    virtual void drawEmptyRow(QPainter* painter, const QRect& rect);
    // Returns the area below the last row; empty if the rows fill the view.
    virtual QRect getEmptyArea() const;
    // cell is the cell in the first column without its indentation.
    virtual KSViewStyle::FirstColumnLayout getLayoutForFirstColumn(const QRect& cell,
                                                                   const QModelIndex& index) const;
    // Returns the rectangle of the row over the full width.
    virtual QRect getIndexVisualRect(const QModelIndex& index) const;
    virtual QVariant getDefaultDesignAttribute(KSVIEW::enumDesignAttributeRole role) const;

    virtual bool onTouchEvent(QTouchEvent* event);
    virtual bool onTouchBeginEvent(QTouchEvent* event);
    virtual bool onTouchUpdateEvent(QTouchEvent* event);
    virtual bool onTouchEndEvent(QTouchEvent* event);
    virtual void onTranslateTouchEndEventToMouse(QTouchEvent* event);

    virtual void setAutoFlick(bool autoFlick) { m_touch.flicker().setGliding(autoFlick); }
    virtual void setStartPoint(const QPoint& point) { m_touch.flicker().setStart(point); }
    virtual void setEndPoint(const QPoint& point) { m_touch.flicker().setEnd(point); }
    virtual bool isFlickEnd() { return m_touch.flicker().isEnd(); }
    virtual bool hasFlicked() { return m_touch.flicker().hasFlicked(); }
    virtual void stopFlick() { m_touch.flicker().stop(); }
    virtual bool isAutoFilck() { return m_touch.flicker().isGliding(); }
    // Returns the distance by which the content moves in this tick, and advances the start point.
    virtual QPoint getDistance();
    virtual QPoint getFlickDistance() { return FlickMotion::pixels(m_touch.flicker().glide()); }
    virtual QPoint getDragDistance() { return FlickMotion::pixels(m_touch.flicker().drag()); }
    // Scrolls the content down by offset pixels, within the range.
    virtual void changeScrollBarValue(int offset);
    // Returns the touch area around a check box.
    virtual QRect getCheckBoxRectForTouch(const QModelIndex& index) const;

    // Ends an edit; the text is committed except with RevertModelCache. Null and editors of other views are
    // ignored.
    void closeEditorState(QWidget* editor, QAbstractItemDelegate::EndEditHint hint);
    // The cell whose editor is open.
    QModelIndex getRenameIndex() const { return m_renameIndex; }
    void setRenameIndex(QModelIndex index);
    void setCheckBoxVisible(bool visible);
    void clearAllLoadingState();
    void clearRecording();
    // Restarts the timers that are running.
    void allTimersReset();

    using QTreeView::edit;
    void keyboardSearch(const QString&) override {} // would change the selection

Q_SIGNALS:
    // Requests the editor of the cell.
    void editorEvent(QModelIndex index);

public Q_SLOTS:
    void slotUpdateLoadingIcon();

protected:
    bool event(QEvent* event) override;
    bool viewportEvent(QEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void drawRow(QPainter* painter, const QStyleOptionViewItem& option,
                 const QModelIndex& index) const override;
    void drawBranches(QPainter* painter, const QRect& rect, const QModelIndex& index) const override;
    bool edit(const QModelIndex& index, EditTrigger trigger, QEvent* event) override;
    void closeEditor(QWidget* editor, QAbstractItemDelegate::EndEditHint hint) override;

private:
    KSViewStyle* m_viewStyle;
    CustomTreeDelegete* m_delegate;
    KSTreeModel* m_treeModel = nullptr; // null if the model is of another class
    QMap<KSVIEW::enumDesignAttributeRole, QVariant> m_designAttributes;
    QPersistentModelIndex m_renameIndex;
    bool m_checkBoxVisible = true;
    TreeTouch m_touch{*this};
    TreeLoadingMarks m_loadingMarks;
};
