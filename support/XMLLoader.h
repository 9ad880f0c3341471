#pragma once

#include "support/IXMLLoader.h"

#include <memory>

class TiXmlDocument;
class TiXmlElement;

// Implements IXMLLoader on a TinyXML document.
class XMLLoader : public IXMLLoader
{
public:
    XMLLoader();
    ~XMLLoader() override;

    bool load(const std::string& path) override;
    bool selectNode(const std::string& name) override;
    bool selectRootNode() override;
    bool save(const std::string& path) override;
    std::string getAttribute(const std::string& node, const std::string& key) override;
    std::string getText(const std::string& node) override;
    bool setAttribute(const std::string& node, const std::string& key, const std::string& value) override;
    bool deleteAttribute(const std::string& node, const std::string& key) override;
    bool createEmptyXML(const std::string& path) override;

private:
    // Searches depth first: the element itself, then its first child, then its siblings.
    static bool GetPointerByNodeName(TiXmlElement* element, const std::string& name, TiXmlElement*& out);
    static std::string getAttributeFromNode(TiXmlElement* element, const std::string& node,
                                            const std::string& key);

    std::unique_ptr<TiXmlDocument> m_document;
    TiXmlElement* m_root;    // owned by m_document
    TiXmlElement* m_current; // owned by m_document
};
