// Loads and saves TinyXML documents.
#pragma once

#include <string>

class TiXmlDocument;

class XmlFile
{
public:
    // Loads a file as TiXmlDocument::LoadFile with TIXML_ENCODING_UTF8 does, line ends included, and names
    // the document after it. Files are UTF-8 whatever they declare. False for what is missing, no plain file,
    // refused by XmlFileGuard, or not XML; the document is then not to be used. Bytes that the disk refused
    // to take (RefusedWrites) are read in place of the file. Any thread.
    static bool load(const std::string& path, TiXmlDocument& document);

    // Replaces the file by the bytes that TiXmlDocument::SaveFile writes, aside and renamed as AtomicFile
    // does. False, with the old file untouched, when the disk refuses.
    static bool save(const TiXmlDocument& document, const std::string& path);

    // The bytes that SaveFile writes, those that are not UTF-8 replaced.
    static std::string toBytes(const TiXmlDocument& document);
};
