#pragma once

#include "touchui/KSCombobox.h"

#include <QRect>
#include <QString>
#include <QStringList>

// The list of families: those of the appliance and the imported ones. Rows hold the stored family but are
// painted with its display name. GUI thread only.
class FontCombox : public KSCombobox
{
    Q_OBJECT
public:
    static constexpr int FAMILY_COUNT = 9;
    static constexpr QRect TEXT_RECT{QPoint(10, 0), QPoint(184, 49)};

    explicit FontCombox(QWidget* parent);

    // Chooses what the list offers: with true the appliance's families and the imported ones, with false the
    // imported ones only. A family that the font system cannot resolve is left out. Keeps the current family
    // if it is still in the list. The list is filled by fill().
    void refreshFontListView(bool isAllItems);
    // Fills the list if it has changed since it was last filled. Resolving the families is slow, so this is
    // called only when the list is needed: while the box is shown and enabled, and when it has a family to
    // show.
    void fill();
    // Registers one file of the folder of imported fonts; with all, drops every import and registers the
    // whole folder. With fromSettings the path of the folder is read from the settings, otherwise the path
    // from the last call is used. Files that are not fonts are skipped.
    void addImportFontsToApplication(bool fromSettings, bool all, const QString& file);

    // Shows the family; an unknown or empty one shows none.
    void setFontFamily(const QString& family);
    void setPreviousFamily(const QString& family) { m_previousFamily = family; }
    QString previousFamily() const { return m_previousFamily; }
    // Selects a row; -1 for none.
    void setCurrentFamily(int index);

    // filterAvailableForSY() keeps the families that the appliance offers or that were imported;
    // filterAvailableFamily() those that the font system resolves to themselves.
    QStringList filterAvailableForSY(const QStringList& families) const;
    static QStringList filterAvailableFamily(const QStringList& families);

protected:
    void changeEvent(QEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void drawText(QPainter& painter, const QRect& area) override;
    void adjustPopupListSize() override;

private:
    void addSpecialDefaultFont();
    void registerFontFile(const QString& path);
    void fillIfNeeded();

    QStringList m_imported;
    QString m_importFolder;
    bool m_allItems = true;
    bool m_isFilled = false;
    QString m_previousFamily;
};
