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

// A tree for one finger: a drag scrolls, a quick one lets the list glide on, a tap selects a row, opens or
// closes it, or works its check box, and a hold of 700 ms asks for the row's name to be edited. A finger that
// lands on a gliding list stops it and presses nothing. The mouse does the same.
//
// pressed() and clicked() come when a tap ends on an enabled row, which is then current; pressed() also with
// a hold. Positions are in viewport coordinates. Works on a KSTreeModel; of other models only what QTreeView
// knows is shown. GUI thread only.
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

    // In the order of CheckBoxImage.
    static QStringList s_checkBoxImagesPath;

    explicit KSTreeView(QWidget* parent = nullptr);
    ~KSTreeView() override;

    void setModel(QAbstractItemModel* model) override;
    // Null when the model is of another class.
    KSTreeModel* treeModel() const { return m_treeModel; }
    KSViewStyle* viewStyle() const { return m_viewStyle.get(); }
    CustomTreeDelegete* treeDelegate() const { return m_delegate; }

    // The value set, else the default.
    QVariant getDesignAttribute(KSVIEW::enumDesignAttributeRole role) const;
    void setDesignAttribute(KSVIEW::enumDesignAttributeRole role, const QVariant& value);
    int rowHeightOf(const QModelIndex& index) const;
    QColor headerTextColor(int section) const;

    // Into the model; false when it refuses.
    virtual bool insertRows(int row, int count, const QModelIndex& parent);
    virtual QRect getCheckBoxRect(const QModelIndex& index) const;
    virtual QRect getIndicatorRect(const QModelIndex& index) const;
    virtual CheckBoxImage getCheckBoxImageType(const QModelIndex& index) const;
    // step counts from 1 to 8; others are taken round.
    virtual QString getLoadingImagePath(int step) const;
    // Toggles a checkable and enabled cell, with all below and above it.
    virtual void changeCheckState(const QModelIndex& index);
    virtual void changeParentsCheckState(const QModelIndex& index);
    // See TreeCheckStates.
    virtual void changeCheckStateByNumber(const QModelIndex& index, int number);
    virtual void changeChildrenCheckState(const QModelIndex& index, Qt::CheckState state);
    // Moves the current row right behind a row of the same parent; false when that cannot be.
    virtual bool moveToSibling(QModelIndex sibling);
    virtual bool isTextElide(const QModelIndex& index) const;
    virtual bool isIndicatorPressed(const QModelIndex& index) const;
    virtual void drawOnEmptyArea(QPainter* painter);
    virtual void drawEmptyRow(QPainter* painter, const QRect& rect);
    // Below the last row; empty when the rows fill the view.
    virtual QRect getEmptyArea() const;
    // cell is the first column's, without its indentation.
    virtual KSViewStyle::FirstColumnLayout getLayoutForFirstColumn(const QRect& cell,
                                                                   const QModelIndex& index) const;
    // The whole row, over the full width.
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
    // By how much the content moves at this tick; moves the start point.
    virtual QPoint getDistance();
    virtual QPoint getFlickDistance() { return FlickMotion::pixels(m_flicker.glide()); }
    virtual QPoint getDragDistance() { return FlickMotion::pixels(m_flicker.drag()); }
    // Scrolls the content down by the offset, within the range.
    virtual void changeScrollBarValue(int offset);
    // The target of a finger around a check box.
    virtual QRect getCheckBoxRectForTouch(const QModelIndex& index) const;

    // Ends an edit; the text is committed except with RevertModelCache. Null and strangers are ignored.
    void closeEditorState(QWidget* editor, QAbstractItemDelegate::EndEditHint hint);
    // The cell whose editor is open.
    QModelIndex getRenameIndex() const { return m_renameIndex; }
    void setRenameIndex(QModelIndex index);
    void setCheckBoxVisible(bool visible);
    void clearAllLoadingState();
    void clearRecording();
    // Starts the timers that run once more from the beginning.
    void allTimersReset();
    void setHoldInterval(int milliseconds) { m_holdInterval = milliseconds; }

    using QTreeView::edit;
    void keyboardSearch(const QString&) override {} // would change the selection

Q_SIGNALS:
    // Opens the editor of the cell.
    void editorEvent(QModelIndex index);
    // A tap made the row current.
    void signalCurrentChangedByTouch(QModelIndex index);
    // A row was held; it is current.
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
