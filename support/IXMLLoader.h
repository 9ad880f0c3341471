#pragma once

#include <string>

// A cursor over one XML document: selects a node, reads or writes its attributes, saves the document. There
// is one cursor and no lock, so different users must not interleave their calls. A missing file, node or
// attribute gives false or an empty string.
class IXMLLoader
{
public:
    virtual ~IXMLLoader() = default;

    // Replaces the document. Returns false if the file cannot be parsed; no node is selected then.
    virtual bool load(const std::string& path) = 0;

    // Selects the first element of that name in a depth-first search that begins with the selected node
    // itself.
    virtual bool selectNode(const std::string& name) = 0;

    // Selects the root element of the document.
    virtual bool selectRootNode() = 0;
    virtual bool save(const std::string& path) = 0;

    // These search as selectNode does, but do not change the selection.
    virtual std::string getAttribute(const std::string& node, const std::string& key) = 0;
    virtual std::string getText(const std::string& node) = 0;
    virtual bool setAttribute(const std::string& node, const std::string& key, const std::string& value) = 0;
    virtual bool deleteAttribute(const std::string& node, const std::string& key) = 0;

    // Replaces the document by an empty element "root" and saves it.
    virtual bool createEmptyXML(const std::string& path) = 0;

    // Returns the only instance, which is created on first use.
    static IXMLLoader* getInstance();
    static void cleanUp();

protected:
    static IXMLLoader* m_pXmlLoader;
};
