#include "canvas/NewTextStyle.h"

#include "canvas/InputLanguageFonts.h"
#include "canvas/TextObjectConstants.h"
#include "document/FontStyle.h"

#include <memory>
#include <vector>

NewTextStyle::NewTextStyle(const QString& sample, const FontStyle& font)
{
    std::vector<TextStyle*> items;
    for (const QChar c : sample) {
        auto style = std::make_unique<TextStyle>();
        style->setText(QString(c).toStdString());
        style->setFontFamily(font.getFamily());
        style->setFontColor(font.getColor());
        style->setFontSize(font.getSize());
        style->setFontBold(font.getBold());
        style->setIsTextItalic(font.getItalic());
        style->setTextKerning(font.getKerning());
        style->setIsTextEdge(font.getEdge());
        style->setTextEdge(*font.getEdgePoint());
        items.push_back(style.release());
    }
    m_last.setText(sample.toStdString());
    m_last.setTextItems(std::move(items));
    m_last.setShadowStyle(font.getShadowStyle());
    m_last.setTextShadow(*font.getShadowPoint());
    m_last.setTextAlign(font.getAlign());
    m_property = m_last;
}

void NewTextStyle::rememberChange(const TText& style)
{
    if (style.textItems().empty())
        return;
    m_last.setTextAlign(style.getTextAlign());
    m_last.setShadowStyle(style.getShadowStyle());
    m_last.setTextShadow(*style.getTextShadow());
    takeFirstCharacter(style);
}

void NewTextStyle::propertyChanged(int id)
{
    m_languageChanged = false;
    if (id == TextObjectConstants::PropertyFamily)
        m_familyOfModel.clear();
}

void NewTextStyle::rememberProperty(const TText& style)
{
    m_property = style;
    m_panelTold = true;
    if (!style.textItems().empty())
        takeFirstCharacter(style);
}

void NewTextStyle::takeFirstCharacter(const TText& style)
{
    auto first = std::make_unique<TextStyle>(*style.textItems().front());
    m_last.releaseVectorTextStyle();
    m_last.setTextItems({first.release()});
}

QString NewTextStyle::rememberedFamily() const
{
    return m_last.textItems().empty() ? QString()
                                      : QString::fromStdString(m_last.textItems().front()->getFontFamily());
}

void NewTextStyle::setLanguageRow(int row)
{
    m_languageChanged = m_languageChanged || row != m_languageRow;
    m_languageRow = row;
}

void NewTextStyle::applyTo(TText& record) const
{
    record.setShadowStyle(m_property.getShadowStyle());
    record.setTextShadow(*m_property.getTextShadow());
    record.setTextAlign(m_property.getTextAlign());
}

NewTextStyle::FirstCharacter NewTextStyle::firstCharacter()
{
    const QString ofLanguage =
        InputLanguageFonts::LAST_KEEPED_FONT[size_t(m_languageRow)][InputLanguageFonts::Asian];
    FirstCharacter first;
    QString family = rememberedFamily();
    if (m_panelTold) {
        // The panel takes precedence. It shows the family of a new language until a text is selected.
        if (m_languageChanged && family == ofLanguage)
            first.ensureMode = 1;
    } else if (!m_familyOfModel.isEmpty()) {
        family = m_familyOfModel;
        first.ensureMode = 0;
    } else if (m_languageChanged) {
        family = ofLanguage;
        first.ensureMode = 1;
    }
    m_languageChanged = false;

    auto style = std::make_unique<TextStyle>();
    if (!m_last.textItems().empty())
        *style = *m_last.textItems().front();
    style->setText(std::string());
    if (!family.isEmpty())
        style->setFontFamily(family.toStdString());
    applyTo(first.record);
    first.record.setTextItems({style.release()});
    return first;
}
