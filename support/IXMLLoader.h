// A cursor over one XML document: select a node, read or write its attributes, save. One cursor and no lock,
// so callers must not interleave. A missing file, node or attribute gives false or an empty string.
#pragma once

#include <string>

class IXMLLoader
{
public:
    virtual ~IXMLLoader() = default;

    // Replaces the document; false when the file cannot be parsed. The cursor then stands nowhere.
    virtual bool load(const std::string& path) = 0;

    // Moves the cursor to the first element of that name, depth first from the cursor, itself included.
    virtual bool selectNode(const std::string& name) = 0;

    // Moves the cursor to the document's root element.
    virtual bool selectRootNode() = 0;
    virtual bool save(const std::string& path) = 0;

    // These search from the cursor as selectNode does, without moving it.
    virtual std::string getAttribute(const std::string& node, const std::string& key) = 0;
    virtual std::string getText(const std::string& node) = 0;
    virtual bool setAttribute(const std::string& node, const std::string& key, const std::string& value) = 0;
    virtual bool deleteAttribute(const std::string& node, const std::string& key) = 0;

    // Replaces the document by one with an empty element "root" and saves it.
    virtual bool createEmptyXML(const std::string& path) = 0;

    // The one instance, made on first use.
    static IXMLLoader* getInstance();
    static void cleanUp();

protected:
    static IXMLLoader* m_pXmlLoader;
};
