#pragma once

#include "touchui/KSCombobox.h"

#include <QRect>
#include <QString>
#include <QStringList>

// The families to choose from: those of the appliance, and those that were imported. Rows hold the stored
// family; what is painted is the name that it is known by. GUI thread only.
class FontCombox : public KSCombobox
{
    Q_OBJECT
public:
    static constexpr int FAMILY_COUNT = 9;
    static constexpr QRect TEXT_RECT{QPoint(10, 0), QPoint(184, 49)};

    explicit FontCombox(QWidget* parent);

    // True offers the appliance's families and the imported ones, false the imported ones alone. A family
    // that the system cannot resolve is left out. The family shown stays, if it is still there.
    void refreshFontListView(bool isAllItems);
    // Registers the file of the folder of imported fonts; with all, forgets every import and registers the
    // whole folder. fromSettings asks the settings where the folder lies, otherwise the last answer is used.
    // Files that are no fonts are passed over.
    void addImportFontsToApplication(bool fromSettings, bool all, const QString& file);
    QStringList importedFamilies() const { return m_imported; }

    // Shows the family; an unknown or empty one shows none.
    void setFontFamily(const QString& family);
    void setPreviousFamily(const QString& family) { m_previousFamily = family; }
    QString previousFamily() const { return m_previousFamily; }
    // A row, or -1 for none.
    void setCurrentFamily(int index);

    // Keep only what the appliance offers or was imported; what the system resolves to itself.
    QStringList filterAvailableForSY(const QStringList& families) const;
    static QStringList filterAvailableFamily(const QStringList& families);

protected:
    void drawText(QPainter& painter, const QRect& area) override;
    void adjustPopupListSize() override;

private:
    void addSpecialDefaultFont();
    void registerFontFile(const QString& path);

    QStringList m_imported;
    QString m_importFolder;
    bool m_allItems = true;
    QString m_previousFamily;
};
