// Writes .xlsx files for tests.
#pragma once

#include <QByteArray>
#include <QFile>
#include <QList>
#include <QString>
#include <utility>
#include <zip.h>

// The parts of a workbook with one worksheet, as spreadsheet programs write them.
struct WorkbookFile {
    QByteArray sheetData; // the rows
    QByteArray strings;   // the shared strings, each in <si>
    bool isPacked = true;

    static QByteArray xml(const QByteArray& root)
    {
        return "<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"yes\"?>\n" + root;
    }
    static QByteArray link(const QByteArray& id, const QByteArray& type, const QByteArray& target)
    {
        return "<Relationship Id=\"" + id +
               "\" Type=\"http://schemas.openxmlformats.org/officeDocument/2006/relationships/" + type +
               "\" Target=\"" + target + "\"/>";
    }
    static QByteArray links(const QByteArray& all)
    {
        return xml("<Relationships xmlns=\"http://schemas.openxmlformats.org/package/2006/relationships\">" +
                   all + "</Relationships>");
    }
    static QByteArray sheet(const QByteArray& rows)
    {
        return xml(
            "<worksheet xmlns=\"http://schemas.openxmlformats.org/spreadsheetml/2006/main\"><sheetData>" +
            rows + "</sheetData></worksheet>");
    }

    // Names and bytes of the parts.
    QList<std::pair<QByteArray, QByteArray>> parts() const
    {
        return {
            {"_rels/.rels", links(link("rId1", "officeDocument", "xl/workbook.xml"))},
            {"xl/workbook.xml",
             xml("<workbook xmlns=\"http://schemas.openxmlformats.org/spreadsheetml/2006/main\" "
                 "xmlns:r=\"http://schemas.openxmlformats.org/officeDocument/2006/relationships\"><sheets>"
                 "<sheet name=\"Chart\" sheetId=\"3\" r:id=\"rId3\"/>"
                 "<sheet name=\"List\" sheetId=\"1\" r:id=\"rId1\"/>"
                 "<sheet name=\"Other\" sheetId=\"4\" r:id=\"rId4\"/></sheets></workbook>")},
            {"xl/_rels/workbook.xml.rels", links(link("rId3", "chartsheet", "chartsheets/sheet1.xml") +
                                                 link("rId4", "worksheet", "worksheets/sheet9.xml") +
                                                 link("rId1", "worksheet", "worksheets/sheet1.xml") +
                                                 link("rId2", "sharedStrings", "/xl/sharedStrings.xml"))},
            {"xl/worksheets/sheet1.xml", sheet(sheetData)},
            {"xl/sharedStrings.xml",
             xml("<sst xmlns=\"http://schemas.openxmlformats.org/spreadsheetml/2006/main\">" + strings +
                 "</sst>")}};
    }

    // Writes a zip file. Returns whether it was written.
    static bool write(const QString& path, const QList<std::pair<QByteArray, QByteArray>>& parts,
                      bool isPacked = true)
    {
        const zipFile file = zipOpen64(QFile::encodeName(path).constData(), APPEND_STATUS_CREATE);
        if (!file)
            return false;
        bool isWritten = true;
        for (const auto& [name, bytes] : parts) {
            const zip_fileinfo info = {};
            isWritten =
                isWritten &&
                zipOpenNewFileInZip64(file, name.constData(), &info, nullptr, 0, nullptr, 0, nullptr,
                                      isPacked ? Z_DEFLATED : 0, Z_DEFAULT_COMPRESSION, 0) == ZIP_OK &&
                zipWriteInFileInZip(file, bytes.constData(), unsigned(bytes.size())) == ZIP_OK &&
                zipCloseFileInZip(file) == ZIP_OK;
        }
        return zipClose(file, nullptr) == ZIP_OK && isWritten;
    }

    bool write(const QString& path) const { return write(path, parts(), isPacked); }
};
