#pragma once

#include <QString>
#include <array>
#include <cstddef>
#include <optional>

class QByteArray;

// What a title offers to be filled from a list: the names of its texts and how wide each may become. It is
// kept beside the title file, as NAME.fields.json:
//
//   {"fields": {"1": {"name": "Name", "fit": {"width": 600, "smallest": 24}}, "2": {"name": "Role"}},
//    "picture": "Photo"}
//
// Everything may be absent: a text without a name is called by its id, "1" to "4", and the column with the
// background picture is called "picture". A copy is independent. Any thread.
class TemplateFields
{
public:
    static constexpr int FIRST_ID = 1;
    static constexpr int LAST_ID = 4;
    // Bytes of the file.
    static constexpr std::size_t FILE_LIMIT = 1024 * 1024;

    // A text whose ink is wider is made smaller.
    struct Fit {
        int width = 0;    // pixels of the 1280 canvas, 1 to 1280
        int smallest = 0; // font size, 1 to 999; stored pixels of the 1920 raster
        bool operator==(const Fit&) const = default;
    };
    struct Field {
        QString name;
        std::optional<Fit> fit;
        bool operator==(const Field&) const = default;
    };

    TemplateFields();
    bool operator==(const TemplateFields&) const = default;

    // id: FIRST_ID to LAST_ID.
    const Field& field(int id) const { return m_fields[std::size_t(id - FIRST_ID)]; }
    void setField(int id, const Field& field) { m_fields[std::size_t(id - FIRST_ID)] = field; }
    // The column with the paths of background pictures.
    const QString& picture() const { return m_picture; }
    void setPicture(const QString& name) { m_picture = name; }

    // Returns the path of the file for a title file.
    static QString pathFor(const QString& titlePath);
    // Reads the file of a title; without the file all names are the usual ones. Sets error to the reason if
    // the file cannot be used, else to an empty string.
    static TemplateFields read(const QString& titlePath, QString& error);
    // As read, from the bytes of the file. Keys that it does not know are errors, since they are misspelt.
    static TemplateFields fromJson(const QByteArray& bytes, QString& error);
    QByteArray toJson() const;

private:
    std::array<Field, LAST_ID - FIRST_ID + 1> m_fields;
    QString m_picture;
};
