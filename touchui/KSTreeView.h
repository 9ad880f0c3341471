#pragma once

#include "touchui/ElidedTextTip.h"
#include "touchui/Flicker.h"
#include "touchui/KSVIEW.h"
#include "touchui/KSViewStyle.h"
#include "touchui/OneFinger.h"
#include "touchui/TreeLoadingMarks.h"

#include <QEvent>
#include <QMap>
#include <QPersistentModelIndex>
#include <QStringList>
#include <QTreeView>
#include <memory>

class CustomTreeDelegete;
class KSScrollBar;
class KSTreeHeaderView;
class KSTreeModel;
class QTouchEvent;

// A tree that is operated with one finger: a drag scrolls, a flick lets the list glide, a tap selects a row,
// expands or collapses it, or toggles its check box, and a hold of 700 ms requests that the row's name is
// edited. A touch on a gliding list only stops it. The mouse works in the same way.
//
// A tap on an enabled row makes it current and emits pressed() and clicked(); a hold emits only pressed().
// Positions are in viewport coordinates. Intended for a KSTreeModel; of other models only the standard roles
// are shown. GUI thread only.
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
    ~KSTreeView() override;

    void setModel(QAbstractItemModel* model) override;
    // Returns null if the model is of another class.
    KSTreeModel* treeModel() const { return m_treeModel; }
    KSViewStyle* viewStyle() const { return m_viewStyle.get(); }
    CustomTreeDelegete* treeDelegate() const { return m_delegate; }

    // Returns the value that was set, or the default.
    QVariant getDesignAttribute(KSVIEW::enumDesignAttributeRole role) const;
    void setDesignAttribute(KSVIEW::enumDesignAttributeRole role, const QVariant& value);
    int rowHeightOf(const QModelIndex& index) const;
    QColor headerTextColor(int section) const;

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

    virtual void setAutoFlick(bool autoFlick) { m_flicker.setGliding(autoFlick); }
    virtual void setStartPoint(const QPoint& point) { m_flicker.setStart(point); }
    virtual void setEndPoint(const QPoint& point) { m_flicker.setEnd(point); }
    virtual bool isFlickEnd() { return m_flicker.isEnd(); }
    virtual bool hasFlicked() { return m_flicker.hasFlicked(); }
    virtual void stopFlick() { m_flicker.stop(); }
    virtual bool isAutoFilck() { return m_flicker.isGliding(); }
    // Returns the distance by which the content moves in this tick, and advances the start point.
    virtual QPoint getDistance();
    virtual QPoint getFlickDistance() { return FlickMotion::pixels(m_flicker.glide()); }
    virtual QPoint getDragDistance() { return FlickMotion::pixels(m_flicker.drag()); }
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
    void setHoldInterval(int milliseconds) { m_holdInterval = milliseconds; }

    using QTreeView::edit;
    void keyboardSearch(const QString&) override {} // would change the selection

Q_SIGNALS:
    // Requests the editor of the cell.
    void editorEvent(QModelIndex index);
    // Emitted when a tap has made the row current.
    void signalCurrentChangedByTouch(QModelIndex index);
    // Emitted when a row was held; it is the current row.
    void signalPressedAndHold(QModelIndex index);

public Q_SLOTS:
    void slotUpdateLoadingIcon();

protected:
    bool event(QEvent* event) override;
    bool viewportEvent(QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void drawRow(QPainter* painter, const QStyleOptionViewItem& option,
                 const QModelIndex& index) const override;
    void drawBranches(QPainter* painter, const QRect& rect, const QModelIndex& index) const override;
    bool edit(const QModelIndex& index, EditTrigger trigger, QEvent* event) override;
    void closeEditor(QWidget* editor, QAbstractItemDelegate::EndEditHint hint) override;
    void hideEvent(QHideEvent* event) override;

protected Q_SLOTS:
    void dataChanged(const QModelIndex& topLeft, const QModelIndex& bottomRight,
                     const QList<int>& roles) override;

private Q_SLOTS:
    void slotHold();

private:
    enum PressState { NotPressed, Pressed, Held };
    static constexpr int HOLD_INTERVAL = 700; // ms

    void initScrollBars();
    void motionStarted();
    void showLastRowWhole();
    void cancelPress();
    void rest();
    QPoint fingerPosition() const;
    void beginPress(const QPoint& point);
    void tap(const QPoint& point);
    void makeCurrent(const QModelIndex& index);
    void sendMouse(QEvent::Type type, const QPoint& point);
    QRect indicatorRectForTouch(const QModelIndex& index) const;
    QRect firstCellRect(const QModelIndex& index) const;
    bool isUsable(const QModelIndex& index) const;
    void showElidedText(const QModelIndex& index);

    std::unique_ptr<KSViewStyle> m_viewStyle;
    CustomTreeDelegete* m_delegate;
    KSTreeModel* m_treeModel = nullptr;
    QMap<KSVIEW::enumDesignAttributeRole, QVariant> m_designAttributes;

    OneFinger m_finger{this};
    Flicker m_flicker{this, FlickMotion::treeView()}; // in viewport coordinates
    bool m_sendingMouse = false;                      // a touch is being passed on as a mouse event

    PressState m_pressState = NotPressed;
    QPoint m_pressPoint;
    bool m_moved = false;
    QPersistentModelIndex m_pressIndex;
    QPersistentModelIndex m_pressedCheckBox;
    QPersistentModelIndex m_pressedIndicator;
    QPersistentModelIndex m_renameIndex;
    bool m_checkBoxVisible = true;

    int m_holdInterval = HOLD_INTERVAL;
    ElidedTextTip m_elidedText;
    TreeLoadingMarks m_loadingMarks;
};
