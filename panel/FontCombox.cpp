#include "panel/FontCombox.h"

#include "document/SettingManager.h"
#include "panel/FontFamilyDelegate.h"
#include "panel/TextToolsPanelController.h"
#include "support/ConfinedPath.h"

#include <QDir>
#include <QEvent>
#include <QFileInfo>
#include <QFontDatabase>
#include <QFontInfo>
#include <QPainter>
#include <QSignalBlocker>

#include <algorithm>
#include <exception>
#include <utility>

namespace
{

const char SPECIAL_DEFAULT_FAMILY[] = "DFHeiW5-A";
constexpr qint64 LARGEST_FONT_FILE = qint64(256) * 1024 * 1024;
constexpr int VISIBLE_ROWS = 10;

const QStringList& applianceFamilies()
{
    static const QStringList families{QStringLiteral("KST"),
                                      QStringLiteral("KST Japanese Pro"),
                                      QStringLiteral("KST Japanese Pro Regular"),
                                      QStringLiteral("DFHeiW5-A"),
                                      QStringLiteral("YDGothic 100 Pro"),
                                      QStringLiteral("Nimbus Sans L"),
                                      QStringLiteral("Nimbus Roman No9 L"),
                                      QStringLiteral("Nimbus Mono L"),
                                      QStringLiteral("DejaVu Sans"),
                                      QStringLiteral("DejaVu Serif"),
                                      QStringLiteral("URW Bookman L"),
                                      QStringLiteral("URW Gothic L"),
                                      QStringLiteral("URW Chancery L"),
                                      QStringLiteral("URW Palladio L"),
                                      QStringLiteral("IPAGothic"),
                                      QStringLiteral("IPAMincho"),
                                      QStringLiteral("IPAPGothic"),
                                      QStringLiteral("IPAPMincho")};
    return families;
}

QString importFolderOfSettings()
{
    try {
        return QString::fromStdWString(SettingManager().getImportFontsPath());
    } catch (const std::exception&) {
        return QString(); // the folder could not be created
    }
}

} // namespace

FontCombox::FontCombox(QWidget* parent) : KSCombobox(parent)
{
    setItemDelegate(new FontFamilyDelegate(this));
    setMaxVisibleItems(VISIBLE_ROWS);
    setListWidthByText(true);
}

void FontCombox::refreshFontListView(bool isAllItems)
{
    m_allItems = isAllItems;
    m_isFilled = false;
    setFontFamily(m_previousFamily);
    fillIfNeeded();
}

void FontCombox::fill()
{
    if (std::exchange(m_isFilled, true))
        return;
    const QSignalBlocker silent(this); // the base class selects the first row for a moment
    const QStringList candidates =
        m_allItems ? filterAvailableForSY(TextToolsPanelController().getFontLib()) : m_imported;
    clear();
    addItems(filterAvailableFamily(candidates));
    setFontFamily(m_previousFamily);
}

void FontCombox::fillIfNeeded()
{
    if (isVisible() && isEnabled())
        fill();
}

void FontCombox::showEvent(QShowEvent* event)
{
    fillIfNeeded();
    KSCombobox::showEvent(event);
}

void FontCombox::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::EnabledChange)
        fillIfNeeded();
    KSCombobox::changeEvent(event);
}

QStringList FontCombox::filterAvailableForSY(const QStringList& families) const
{
    QStringList kept;
    std::copy_if(families.begin(), families.end(), std::back_inserter(kept), [this](const QString& family) {
        return applianceFamilies().contains(family) || m_imported.contains(family);
    });
    return kept;
}

QStringList FontCombox::filterAvailableFamily(const QStringList& families)
{
    QStringList kept;
    std::copy_if(families.begin(), families.end(), std::back_inserter(kept),
                 [](const QString& family) { return QFontInfo(QFont(family)).family() == family; });
    return kept;
}

void FontCombox::addImportFontsToApplication(bool fromSettings, bool all, const QString& file)
{
    if (fromSettings)
        m_importFolder = importFolderOfSettings();
    if (all) {
        m_imported.clear();
        addSpecialDefaultFont();
        QFontDatabase::removeAllApplicationFonts();
        if (!m_importFolder.isEmpty()) {
            const QDir folder(m_importFolder);
            for (const QString& entry : folder.entryList(QDir::Files, QDir::Name))
                registerFontFile(folder.filePath(entry));
        }
    } else if (!m_importFolder.isEmpty() && !file.isEmpty()) {
        registerFontFile(m_importFolder + QLatin1Char('/') + file);
    }
    refreshFontListView(m_allItems);
}

void FontCombox::addSpecialDefaultFont()
{
    const QString family = QString::fromLatin1(SPECIAL_DEFAULT_FAMILY);
    if (!m_imported.contains(family))
        m_imported.append(family);
}

// Registers a font file. Skips pipes, which would block, and files above the size limit, and refuses paths
// outside the folder of imported fonts. The font system itself rejects files that are not fonts.
void FontCombox::registerFontFile(const QString& path)
{
    const QFileInfo info(path);
    if (!info.isFile() || info.size() > LARGEST_FONT_FILE)
        return;
    if (!ConfinedPath::isBelow(m_importFolder.toStdString(), path.toStdString())) {
        ConfinedPath::logRefusal(L"a font is said to be in: ", path.toStdString());
        return;
    }
    const int id = QFontDatabase::addApplicationFont(path);
    if (id < 0)
        return;
    for (const QString& family : QFontDatabase::applicationFontFamilies(id))
        if (!m_imported.contains(family))
            m_imported.append(family);
}

void FontCombox::setFontFamily(const QString& family)
{
    setPreviousFamily(family);
    if (!family.isEmpty())
        fill();
    setCurrentFamily(
        family.isEmpty() ? -1 : findData(family, Qt::DisplayRole, Qt::MatchExactly | Qt::MatchCaseSensitive));
}

void FontCombox::setCurrentFamily(int index)
{
    setCurrentIndex(index);
}

void FontCombox::drawText(QPainter& painter, const QRect&)
{
    const QString name = FontFamilyDelegate::changeFamilyName(currentText());
    painter.drawText(TEXT_RECT, Qt::AlignLeft | Qt::AlignVCenter | Qt::TextSingleLine,
                     painter.fontMetrics().elidedText(name, Qt::ElideRight, TEXT_RECT.width()));
}

// Makes the list as wide as the widest display name in its own font.
void FontCombox::adjustPopupListSize()
{
    KSCombobox::adjustPopupListSize();
    int longest = 0;
    QStyleOptionViewItem option;
    option.initFrom(this);
    option.font = font();
    for (int row = 0; row < count(); ++row)
        longest = std::max(longest, itemDelegate()->sizeHint(option, model()->index(row, 0)).width());
    setListWidth(width(), longest);
}
