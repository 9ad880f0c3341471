#include "touchui/KSModelDataFactory.h"

#include <QLineEdit>

KSModelDataFactory::KSModelDataFactory(QObject* parent) : QObject(parent)
{
}

QWidget* KSModelDataFactory::createControl(QWidget* parent, _controlType, const QModelIndex&)
{
    return new QLineEdit(parent);
}

KSModelDataFactory::KSDataType KSModelDataFactory::getColumnDataType(int column) const
{
    return m_columnDataTypes.value(column, NoDataType);
}

void KSModelDataFactory::setColumnDataType(int column, KSDataType type)
{
    m_columnDataTypes.insert(column, type);
}
