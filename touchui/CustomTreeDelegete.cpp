#include "touchui/CustomTreeDelegete.h"

#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"
#include "touchui/KSViewStyle.h"

#include <QLineEdit>
#include <QPainter>

namespace
{

constexpr int EDITOR_MARGIN = 2; // above and below the editor

} // namespace

CustomTreeDelegete::CustomTreeDelegete(KSTreeView* view, const KSViewStyle* style)
    : QStyledItemDelegate(view), m_view(view), m_style(style)
{
}

// Returns null if the model of the view is of another class.
KSTreeModel* CustomTreeDelegete::treeModel() const
{
    return qobject_cast<KSTreeModel*>(m_view->model());
}

QRect CustomTreeDelegete::textRect(const QRect& cell, const QModelIndex& index) const
{
    return index.column() == 0 ? m_view->getLayoutForFirstColumn(cell, index).text : m_style->textRect(cell);
}

void CustomTreeDelegete::paint(QPainter* painter, const QStyleOptionViewItem& option,
                               const QModelIndex& index) const
{
    QStyleOptionViewItem cell = option;
    initStyleOption(&cell, index);
    m_style->drawControl(QStyle::CE_ItemViewItem, &cell, painter, m_view);
}

QSize CustomTreeDelegete::sizeHint(const QStyleOptionViewItem&, const QModelIndex& index) const
{
    const KSTreeModel* model = treeModel();
    const int own = model != nullptr ? model->getItemHeight(index) : 0;
    const int height = own > 0 ? own : m_view->getDesignAttribute(KSVIEW::DesignRowHeight).toInt();
    return QSize(m_view->columnWidth(index.column()), height);
}

QWidget* CustomTreeDelegete::createEditor(QWidget* parent, const QStyleOptionViewItem&,
                                          const QModelIndex& index) const
{
    KSTreeModel* model = treeModel();
    if (model == nullptr || model->factory() == nullptr)
        return nullptr;
    QWidget* editor = model->factory()->createControl(parent, KSModelDataFactory::LineEditControl, index);
    if (auto* line = qobject_cast<QLineEdit*>(editor))
        Q_EMIT signalLineEditInitialize(line, index);
    return editor;
}

void CustomTreeDelegete::setEditorData(QWidget* editor, const QModelIndex& index) const
{
    if (auto* line = qobject_cast<QLineEdit*>(editor)) {
        const QString text = index.data(Qt::EditRole).toString();
        // Data of the row can change while its name is being edited.
        if (!line->isModified() && line->text() != text)
            line->setText(text);
    } else {
        QStyledItemDelegate::setEditorData(editor, index);
    }
}

void CustomTreeDelegete::setModelData(QWidget* editor, QAbstractItemModel* model,
                                      const QModelIndex& index) const
{
    if (const auto* line = qobject_cast<QLineEdit*>(editor)) {
        const QString text = line->text();
        const QPersistentModelIndex cell(index);
        model->setData(index, text, Qt::EditRole);
        Q_EMIT signalLineEditCommitted(text, cell);
    } else {
        QStyledItemDelegate::setModelData(editor, model, index);
    }
}

void CustomTreeDelegete::updateEditorGeometry(QWidget* editor, const QStyleOptionViewItem& option,
                                              const QModelIndex& index) const
{
    editor->setGeometry(textRect(option.rect, index).adjusted(0, EDITOR_MARGIN, 0, -EDITOR_MARGIN));
}

bool CustomTreeDelegete::eventFilter(QObject* object, QEvent* event)
{
    const KSTreeModel* model = treeModel();
    if (model != nullptr && model->factory() != nullptr && model->factory()->isControlSelfEnding())
        return false;
    return QStyledItemDelegate::eventFilter(object, event);
}
