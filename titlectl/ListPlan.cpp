#include "titlectl/ListPlan.h"

#include "canvas/TextObjectConstants.h"
#include "document/Archive.h"
#include "document/FolderOrder.h"
#include "document/PictureReader.h"
#include "document/TText.h"
#include "library/TitleFileOperations.h"
#include "titlectl/ListTable.h"
#include "titlectl/TextFields.h"
#include "titlectl/TextFit.h"

#include <QByteArray>
#include <QChar>
#include <QCryptographicHash>
#include <QFile>
#include <QFileInfo>
#include <QList>
#include <QStringView>
#include <algorithm>
#include <optional>
#include <utility>

namespace
{

// Characters of the readable part of a file name; the name with the ending of a picture has to be short
// enough for the disk.
constexpr int READABLE_LENGTH = 40;
constexpr int HASH_LENGTH = 12;
constexpr int ROW_DIGITS = 6;

// Returns the letters and digits of a text with "-" for everything else.
QString readable(const QString& text)
{
    QString result;
    const QList<uint> characters = text.toLower().toUcs4();
    for (const uint c : characters) {
        if (result.size() >= READABLE_LENGTH)
            break;
        if (QChar::isLetterOrNumber(c))
            result += QStringView(QChar::fromUcs4(c));
        else if (!result.isEmpty() && !result.endsWith(QLatin1Char('-')))
            result += QLatin1Char('-');
    }
    return result.endsWith(QLatin1Char('-')) ? result.chopped(1) : result;
}

QString hashOf(const QString& text)
{
    const QByteArray hash = QCryptographicHash::hash(text.toUtf8(), QCryptographicHash::Sha256).toHex();
    return QString::fromLatin1(hash.left(HASH_LENGTH));
}

} // namespace

ListPlan::ListPlan(const Source& source) : m_source(source)
{
    m_error = source.table.error();
    if (!m_error.isEmpty())
        return;
    m_pictureColumn = source.table.columnOf(source.fields.picture());
    m_keyColumn = source.key.isEmpty() ? -1 : source.table.columnOf(source.key);
    if (!source.key.isEmpty() && m_keyColumn < 0)
        m_error = QStringLiteral("The list has no column \"%1\"").arg(source.key);
    if (m_error.isEmpty())
        planFillings();
    if (m_error.isEmpty())
        planRows();
}

ListPlan::~ListPlan() = default;

void ListPlan::planFillings()
{
    QSet<int> used{m_keyColumn, m_pictureColumn};
    const std::vector<TText*>& texts = m_source.sample.text();
    QSet<int> ids;
    for (std::size_t index = 0; index < texts.size(); ++index) {
        Filling filling;
        filling.index = index;
        filling.id = texts[index]->getTextObjectID();
        if (filling.id < TemplateFields::FIRST_ID || filling.id > TemplateFields::LAST_ID ||
            ids.contains(filling.id))
            continue;
        ids.insert(filling.id);
        if (const QStringList names = TextFields::partNames(*texts[index]); !names.isEmpty()) {
            if (!planParts(filling, names))
                return;
        } else {
            filling.column = m_source.table.columnOf(m_source.fields.field(filling.id).name);
            if (filling.column < 0)
                continue; // the text stays as it is
        }
        used.insert(filling.column);
        for (const int column : std::as_const(filling.parts))
            used.insert(column);
        m_fillings.push_back(std::move(filling));
    }
    if (m_fillings.empty() && m_pictureColumn < 0)
        m_error = QStringLiteral("No column of the list has the name of a field of the template");
    noteUnusedColumns(used);
}

// A part that nothing fills would be shown with its braces.
bool ListPlan::planParts(Filling& filling, const QStringList& names)
{
    for (const QString& name : names) {
        const int column = m_source.table.columnOf(name);
        if (column < 0) {
            m_error = QStringLiteral("The list has no column \"%1\" for \"{%1}\" in text %2")
                          .arg(name, QString::number(filling.id));
            return false;
        }
        filling.parts.insert(name, column);
    }
    return true;
}

void ListPlan::noteUnusedColumns(const QSet<int>& used)
{
    for (int column = 0; column < m_source.table.columnCount(); ++column)
        if (const QString name = m_source.table.columnName(column); !name.isEmpty() && !used.contains(column))
            m_notes.append(QStringLiteral("The column \"%1\" is not used").arg(name));
}

QSet<QString> ListPlan::existingTitles() const
{
    QSet<QString> names;
    for (const ArchiveOrder& row : FolderOrder::rowsToShow(QFile::encodeName(m_source.folder).toStdString()))
        names.insert(QString::fromStdString(row.getArchivePath()));
    return names;
}

void ListPlan::planRows()
{
    const QSet<QString> existing = existingTitles();
    QHash<QString, int> lines; // by stem
    m_rows.reserve(std::size_t(m_source.table.rowCount()));
    for (int row = 0; row < m_source.table.rowCount(); ++row) {
        Row planned = planRow(row, lines);
        const QString file = planned.stem + TitleFileOperations::XML_EXTENSION;
        if (planned.outcome == Outcome::Made && existing.contains(file) &&
            QFile::exists(m_source.folder + QLatin1Char('/') + file))
            planned.outcome = Outcome::Updated;
        m_rows.push_back(std::move(planned));
    }
}

ListPlan::Row ListPlan::planRow(int row, QHash<QString, int>& lines) const
{
    Row planned;
    planned.line = m_source.table.line(row);
    planned.reason = m_source.table.fault(row);
    if (!planned.reason.isEmpty())
        return planned;
    const QString stem = stemOf(row);
    if (stem.isEmpty()) {
        planned.reason = QStringLiteral("it has no key");
    } else if (lines.contains(stem)) {
        planned.reason = QStringLiteral("it has the key of line %1").arg(lines.value(stem));
    } else {
        Archive title(m_source.sample);
        planned.reason = fill(row, title);
        if (planned.reason.isEmpty())
            planned.reason = checkPicture(row);
    }
    if (!planned.reason.isEmpty())
        return planned;
    lines.insert(stem, planned.line);
    planned.stem = stem;
    planned.outcome = Outcome::Made;
    return planned;
}

// Returns an empty string for a row without a key.
QString ListPlan::stemOf(int row) const
{
    if (m_keyColumn >= 0) {
        const QString key = m_source.table.cell(row, m_keyColumn).trimmed();
        const QString column = m_source.table.columnName(m_keyColumn).toCaseFolded();
        return key.isEmpty() ? QString()
                             : readable(key) + QLatin1Char('_') + hashOf(column + QLatin1Char('\n') + key);
    }
    const QString list = QFileInfo(m_source.listPath).completeBaseName();
    return QStringLiteral("%1_%2_%3")
        .arg(readable(list), hashOf(list))
        .arg(row + 1, ROW_DIGITS, 10, QLatin1Char('0'));
}

QString ListPlan::fillText(int row, const Filling& filling, TText& text) const
{
    const TText before = text;
    const TemplateFields::Field& field = m_source.fields.field(filling.id);
    if (filling.column >= 0) {
        TextFields::replaceAll(text, m_source.table.cell(row, filling.column));
    } else {
        TextFields::replaceParts(text, [&](const QString& name) -> std::optional<QString> {
            return m_source.table.cell(row, filling.parts.value(name, -1));
        });
    }
    if (TextFields::isBlank(text))
        return {};
    if (const int count = TextFields::characterCount(text); count > TextObjectConstants::CHARACTER_LIMIT) {
        return QStringLiteral("field \"%1\" has %2 characters, %3 is the limit")
            .arg(field.name, QString::number(count), QString::number(TextObjectConstants::CHARACTER_LIMIT));
    }
    if (field.fit && !TextFit::shrink(text, *field.fit)) {
        return QStringLiteral("field \"%1\" is %2 pixels wide at the smallest size, %3 is the limit")
            .arg(field.name, QString::number(int(TextFit::inkWidth(text))),
                 QString::number(field.fit->width));
    }
    TextFit::keepAlignment(text, before);
    return {};
}

QString ListPlan::fill(int row, Archive& title) const
{
    for (const Filling& filling : m_fillings)
        if (const QString reason = fillText(row, filling, *title.text()[filling.index]); !reason.isEmpty())
            return reason;
    std::vector<TText*> kept;
    for (TText* text : title.text())
        if (TextFields::isBlank(*text))
            delete text;
        else
            kept.push_back(text);
    title.setText(kept);
    return kept.empty() && picture(row).isEmpty() ? QStringLiteral("it has no text") : QString();
}

QString ListPlan::picture(int row) const
{
    const QString name =
        m_pictureColumn < 0 ? QString() : m_source.table.cell(row, m_pictureColumn).trimmed();
    if (name.isEmpty() || QFileInfo(name).isAbsolute())
        return name;
    return QFileInfo(m_source.listPath).path() + QLatin1Char('/') + name;
}

QString ListPlan::checkPicture(int row) const
{
    const QString path = picture(row);
    if (path.isEmpty() || !PictureReader(path).size().isEmpty())
        return {};
    return QFile::exists(path) ? QStringLiteral("the picture %1 cannot be read").arg(path)
                               : QStringLiteral("there is no picture %1").arg(path);
}

int ListPlan::count(Outcome outcome) const
{
    return int(std::count_if(m_rows.begin(), m_rows.end(),
                             [outcome](const Row& row) { return row.outcome == outcome; }));
}

std::unique_ptr<Archive> ListPlan::title(int row) const
{
    const QString& stem = m_rows[std::size_t(row)].stem;
    auto title = std::make_unique<Archive>(m_source.sample);
    fill(row, *title);
    title->setName(stem.toStdString());
    title->setPath(
        (m_source.folder + QLatin1Char('/') + stem + TitleFileOperations::XML_EXTENSION).toStdString());
    title->setThumbnailBig((stem + TitleFileOperations::THUMBNAIL_BIG).toStdString());
    title->setThumbnailMiddle((stem + TitleFileOperations::THUMBNAIL_MIDDLE).toStdString());
    title->setThumbnailSmall((stem + TitleFileOperations::THUMBNAIL_SMALL).toStdString());
    title->setThumbnailBlack((stem + TitleFileOperations::THUMBNAIL_BLACK).toStdString());
    return title;
}
