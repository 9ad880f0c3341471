#pragma once

#include <QStyledItemDelegate>

class KSTreeModel;
class KSTreeView;
class KSViewStyle;
class QLineEdit;

// Paints the cells of a KSTreeView with its style and opens the editors that the model's factory creates.
class CustomTreeDelegete : public QStyledItemDelegate
{
    Q_OBJECT
public:
    // The view owns the delegate and the style.
    CustomTreeDelegete(KSTreeView* view, const KSViewStyle* style);

    // Returns the rectangle of the text in a cell, both in viewport coordinates.
    QRect textRect(const QRect& cell, const QModelIndex& index) const;

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
               const QModelIndex& index) const override;
    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override;
    QWidget* createEditor(QWidget* parent, const QStyleOptionViewItem& option,
                          const QModelIndex& index) const override;
    void setEditorData(QWidget* editor, const QModelIndex& index) const override;
    // Commits the text of a line edit; the base class handles other editors.
    void setModelData(QWidget* editor, QAbstractItemModel* model, const QModelIndex& index) const override;
    void updateEditorGeometry(QWidget* editor, const QStyleOptionViewItem& option,
                              const QModelIndex& index) const override;

Q_SIGNALS:
    // Emitted when a line edit was opened in the cell, before its text is set.
    void signalLineEditInitialize(QLineEdit* editor, const QModelIndex& index) const;
    // Emitted when the text was committed to the model.
    void signalLineEditCommitted(const QString& text, const QModelIndex& index) const;

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    KSTreeModel* treeModel() const;

    KSTreeView* m_view;
    const KSViewStyle* m_style;
};
