#pragma once

#include <string>

class TiXmlDocument;

// Loads and saves TinyXML documents.
class XmlFile
{
public:
    // Loads a file as TiXmlDocument::LoadFile does, including its handling of line ends, but as UTF-8
    // whatever encoding the file declares, and sets the document's name. Returns false if the file is
    // missing, not a regular file, refused by XmlFileGuard, or not XML; the document must not be used then.
    // If RefusedWrites keeps bytes for the file, these are read instead. Any thread.
    static bool load(const std::string& path, TiXmlDocument& document);

    // Replaces the file with the bytes that TiXmlDocument::SaveFile writes, by an atomic rename as AtomicFile
    // does. Returns false, with the old file unchanged, on failure.
    static bool save(const TiXmlDocument& document, const std::string& path);

    // Returns the bytes that SaveFile writes, with invalid UTF-8 replaced.
    static std::string toBytes(const TiXmlDocument& document);
};
