#include "panel/FamilyToolBox.h"

#include "canvas/TextObjectConstants.h"
#include "panel/FontCombox.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QScopedValueRollback>

const QString FamilyToolBox::REST_TEXT_STYLE = QStringLiteral("color:rgb(0, 0, 0); font:20px;");
const QString FamilyToolBox::DISABLED_TEXT_STYLE = QStringLiteral("color:rgb(40, 40, 40); font:20px;");

FamilyToolBox::FamilyToolBox(QWidget* parent) : ToolBox(parent)
{
    m_label = addLabel(QSize(TYPELABEL_WIDTH, WIDGET_HEIGHT));
    m_box = new FontCombox(this);
    m_box->setObjectName(QStringLiteral("FamilyBox"));
    m_box->setFixedSize(FAMILYCOMBOBOX_WIDTH, WIDGET_HEIGHT);
    m_box->setStyleSheet(REST_TEXT_STYLE);

    QHBoxLayout* row = addRow(WIDGET_HEIGHT);
    row->addWidget(m_label);
    row->addSpacing(SPACING_BEWTEEN_LABEL_AND_FAMILYCOMBOBOX);
    row->addWidget(m_box);
    row->addSpacing(SPACING_BEWTEEN_FAMILYCOMBOBOX_AND_COLORBUTTON);

    m_box->addImportFontsToApplication(true, true, QString());
    connect(m_box, &QComboBox::currentTextChanged, this, &FamilyToolBox::fontFamilyChanged);
    connect(m_box, &KSCombobox::signalPopupShow, this,
            [this] { Q_EMIT signalClearSizeBoxLineEditFocus(true); });
    connect(m_box, &KSCombobox::signalShowComboxList, this, &FamilyToolBox::signalShowComboxList);
    translateText();
}

void FamilyToolBox::fontFamilyChanged(const QString& family)
{
    if (m_mute || family.isEmpty())
        return;
    m_box->setPreviousFamily(family);
    Q_EMIT familyChange(family, TextObjectConstants::PropertyFamily);
}

void FamilyToolBox::setFontFamily(const QString& family)
{
    const QScopedValueRollback<bool> mute(m_mute, true);
    m_box->setFontFamily(family);
}

QString FamilyToolBox::getFontFamily() const
{
    return m_box->currentText();
}

void FamilyToolBox::importFontFamilyNotify(const QString& file)
{
    const QScopedValueRollback<bool> mute(m_mute, true);
    m_box->addImportFontsToApplication(true, false, file);
}

void FamilyToolBox::modifyComboxItem(bool isAllItems)
{
    const QScopedValueRollback<bool> mute(m_mute, true);
    m_box->refreshFontListView(isAllItems);
}

void FamilyToolBox::hideComboxList()
{
    m_box->hidePopup();
}

void FamilyToolBox::setWidgetEnabled()
{
    if (!isBoxEnabled())
        m_box->setStyleSheet(REST_TEXT_STYLE);
    ToolBox::setWidgetEnabled();
    m_box->setEnabled(true);
}

void FamilyToolBox::setWidgetDisabled()
{
    if (isBoxEnabled())
        m_box->setStyleSheet(DISABLED_TEXT_STYLE);
    ToolBox::setWidgetDisabled();
    m_box->setEnabled(false);
}

void FamilyToolBox::resetInitializeStyle()
{
    setFontFamily(QString());
    ToolBox::resetInitializeStyle();
}

void FamilyToolBox::translateText()
{
    m_label->setText(tr("Font"));
}
