#include "titlectl/TemplateFields.h"

#include "canvas/TextObjectConstants.h"
#include "support/AtomicFile.h"

#include <QByteArray>
#include <QFile>
#include <QJsonDocument>
#include <QJsonObject>
#include <QJsonParseError>
#include <QJsonValue>
#include <QSet>
#include <QStringList>
#include <cerrno>
#include <cstring>

namespace
{

constexpr char FIELDS[] = "fields";
constexpr char NAME[] = "name";
constexpr char FIT[] = "fit";
constexpr char WIDTH[] = "width";
constexpr char SMALLEST[] = "smallest";
constexpr char PICTURE[] = "picture";
constexpr int CANVAS_WIDTH = int(TextObjectConstants::SCENE_RECT.width());

QString key(const char* name)
{
    return QString::fromLatin1(name);
}

// Reads the parts of the file. The first error stays.
class FieldsScan
{
public:
    TemplateFields run(const QJsonObject& root)
    {
        checkKeys(root, {key(FIELDS), key(PICTURE)}, QStringLiteral("the file"));
        const QJsonValue fields = root.value(key(FIELDS));
        if (!fields.isUndefined() && !fields.isObject())
            fail(QStringLiteral("\"fields\" is not an object"));
        const QJsonObject byId = fields.toObject();
        for (auto pair = byId.begin(); pair != byId.end(); ++pair)
            readField(pair.key(), pair.value());
        if (root.contains(key(PICTURE)))
            m_result.setPicture(readName(root.value(key(PICTURE)), key(PICTURE)));
        checkNames();
        return m_error.isEmpty() ? m_result : TemplateFields();
    }

    const QString& error() const { return m_error; }

private:
    void fail(const QString& reason)
    {
        if (m_error.isEmpty())
            m_error = reason;
    }

    void checkKeys(const QJsonObject& object, const QStringList& known, const QString& where)
    {
        const QStringList keys = object.keys();
        for (const QString& each : keys)
            if (!known.contains(each))
                fail(QStringLiteral("\"%1\" in %2 is not known").arg(each, where));
    }

    QString readName(const QJsonValue& value, const QString& where)
    {
        const QString name = value.toString().trimmed();
        if (!value.isString() || name.isEmpty())
            fail(QStringLiteral("The name in \"%1\" is not a text").arg(where));
        else if (name.contains(QLatin1Char('{')) || name.contains(QLatin1Char('}')))
            fail(QStringLiteral("The name \"%1\" has a brace").arg(name));
        else if (!name.isValidUtf16())
            fail(QStringLiteral("The name in \"%1\" has half a character").arg(where));
        return name;
    }

    void readField(const QString& id, const QJsonValue& value)
    {
        bool isNumber = false;
        const int number = id.toInt(&isNumber);
        if (!isNumber || id != QString::number(number) || number < TemplateFields::FIRST_ID ||
            number > TemplateFields::LAST_ID) {
            fail(QStringLiteral("\"%1\" is not the id of a text").arg(id));
            return;
        }
        if (!value.isObject())
            fail(QStringLiteral("The field \"%1\" is not an object").arg(id));
        const QJsonObject object = value.toObject();
        checkKeys(object, {key(NAME), key(FIT)}, QStringLiteral("field \"%1\"").arg(id));
        TemplateFields::Field field = m_result.field(number);
        if (object.contains(key(NAME)))
            field.name = readName(object.value(key(NAME)), id);
        if (object.contains(key(FIT)))
            field.fit = readFit(object.value(key(FIT)), id);
        m_result.setField(number, field);
    }

    TemplateFields::Fit readFit(const QJsonValue& value, const QString& id)
    {
        if (!value.isObject())
            fail(QStringLiteral("\"fit\" of field \"%1\" is not an object").arg(id));
        const QJsonObject object = value.toObject();
        checkKeys(object, {key(WIDTH), key(SMALLEST)}, QStringLiteral("\"fit\" of field \"%1\"").arg(id));
        TemplateFields::Fit fit;
        fit.width = readNumber(object.value(key(WIDTH)), CANVAS_WIDTH, QStringLiteral("width"), id);
        fit.smallest = TextObjectConstants::DEFAULT_MINIMUM_SIZE;
        if (object.contains(key(SMALLEST))) {
            fit.smallest = readNumber(object.value(key(SMALLEST)), TextObjectConstants::MAXIMUM_FONT_SIZE,
                                      QStringLiteral("smallest"), id);
        }
        return fit;
    }

    int readNumber(const QJsonValue& value, int highest, const QString& what, const QString& id)
    {
        const int number = value.toInt(0);
        if (number < 1 || number > highest)
            fail(QStringLiteral("\"%1\" of field \"%2\" is not a number from 1 to %3")
                     .arg(what, id)
                     .arg(highest));
        return number;
    }

    void checkNames()
    {
        QSet<QString> names;
        for (int id = TemplateFields::FIRST_ID; id <= TemplateFields::LAST_ID; ++id)
            checkName(names, m_result.field(id).name);
        checkName(names, m_result.picture());
    }

    void checkName(QSet<QString>& names, const QString& name)
    {
        if (names.contains(name.toCaseFolded()))
            fail(QStringLiteral("Two fields are named \"%1\"").arg(name));
        names.insert(name.toCaseFolded());
    }

    TemplateFields m_result;
    QString m_error;
};

} // namespace

TemplateFields::TemplateFields() : m_picture(key(PICTURE))
{
    for (int id = FIRST_ID; id <= LAST_ID; ++id)
        setField(id, {QString::number(id), std::nullopt});
}

QString TemplateFields::pathFor(const QString& titlePath)
{
    static const QString ENDING = QStringLiteral(".xml");
    const bool isTitle = titlePath.endsWith(ENDING, Qt::CaseInsensitive);
    return titlePath.chopped(isTitle ? ENDING.size() : 0) + QLatin1String(".fields.json");
}

TemplateFields TemplateFields::read(const QString& titlePath, QString& error)
{
    error.clear();
    std::string bytes;
    errno = 0;
    if (AtomicFile::read(QFile::encodeName(pathFor(titlePath)).toStdString(), FILE_LIMIT, bytes))
        return fromJson(QByteArray::fromStdString(bytes), error);
    if (errno != ENOENT)
        error = QString::fromLocal8Bit(std::strerror(errno));
    return {};
}

TemplateFields TemplateFields::fromJson(const QByteArray& bytes, QString& error)
{
    error.clear();
    QJsonParseError parsed;
    const QJsonDocument document = QJsonDocument::fromJson(bytes, &parsed);
    if (parsed.error != QJsonParseError::NoError) {
        error = QStringLiteral("It is not JSON: %1 at byte %2").arg(parsed.errorString()).arg(parsed.offset);
        return {};
    }
    if (!document.isObject()) {
        error = QStringLiteral("It is not an object");
        return {};
    }
    FieldsScan scan;
    const TemplateFields fields = scan.run(document.object());
    error = scan.error();
    return fields;
}

QByteArray TemplateFields::toJson() const
{
    const TemplateFields usual;
    QJsonObject byId;
    for (int id = FIRST_ID; id <= LAST_ID; ++id) {
        const Field& each = field(id);
        QJsonObject object;
        if (each.name != usual.field(id).name)
            object.insert(key(NAME), each.name);
        if (each.fit)
            object.insert(key(FIT),
                          QJsonObject{{key(WIDTH), each.fit->width}, {key(SMALLEST), each.fit->smallest}});
        if (!object.isEmpty())
            byId.insert(QString::number(id), object);
    }
    QJsonObject root;
    if (!byId.isEmpty())
        root.insert(key(FIELDS), byId);
    if (m_picture != usual.m_picture)
        root.insert(key(PICTURE), m_picture);
    return QJsonDocument(root).toJson();
}
