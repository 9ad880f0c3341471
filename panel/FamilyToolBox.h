#pragma once

#include "panel/ToolBox.h"

class FontCombox;

// Chooses the font family of the text.
class FamilyToolBox : public ToolBox
{
    Q_OBJECT
public:
    static constexpr int DEFAULT_VALUE = -1;
    static constexpr int TYPELABEL_WIDTH = 100;
    static constexpr int WIDGET_HEIGHT = 50;
    static constexpr int SPACING_BEWTEEN_LABEL_AND_FAMILYCOMBOBOX = 12;
    static constexpr int FAMILYCOMBOBOX_WIDTH = 214;
    static constexpr int LAYOUT_SPACING = 0;
    static constexpr int LAYOUT_MARGIN = 0;
    static constexpr int SPACING_BEWTEEN_FAMILYCOMBOBOX_AND_COLORBUTTON = 7;
    static const QString REST_TEXT_STYLE;
    static const QString DISABLED_TEXT_STYLE;

    explicit FamilyToolBox(QWidget* parent);

    // Shows the family without a signal; an empty or unknown one shows none.
    void setFontFamily(const QString& family);
    // Returns the family shown; empty when none is shown.
    QString getFontFamily() const;

    // Called when a font file was added to the folder of imported fonts, with the name of the file.
    void importFontFamilyNotify(const QString& file);
    // Sets which families are offered: with true all, with false the imported ones only.
    void modifyComboxItem(bool isAllItems);
    void hideComboxList();
    FontCombox* comboBox() const { return m_box; }

    void setWidgetEnabled() override;
    void setWidgetDisabled() override;
    void resetInitializeStyle() override;
    void translateText() override;

Q_SIGNALS:
    void familyChange(QString family, int id);
    void signalShowComboxList(bool shown);

private:
    void fontFamilyChanged(const QString& family);

    QLabel* m_label = nullptr;
    FontCombox* m_box = nullptr;
    bool m_mute = false; // set while code writes to the box
};
