#include "support/XMLLoader.h"

#include "support/XmlFile.h"

#include <mutex>
#include <tinyxml.h>

IXMLLoader* IXMLLoader::m_pXmlLoader = nullptr;

namespace
{

std::mutex gInstanceMutex;

}

IXMLLoader* IXMLLoader::getInstance()
{
    const std::lock_guard lock(gInstanceMutex);
    if (!m_pXmlLoader)
        m_pXmlLoader = new XMLLoader;
    return m_pXmlLoader;
}

void IXMLLoader::cleanUp()
{
    const std::lock_guard lock(gInstanceMutex);
    delete m_pXmlLoader;
    m_pXmlLoader = nullptr;
}

XMLLoader::XMLLoader() : m_root(nullptr), m_current(nullptr)
{
}

XMLLoader::~XMLLoader() = default;

bool XMLLoader::load(const std::string& path)
{
    m_root = m_current = nullptr;
    m_document = std::make_unique<TiXmlDocument>();
    if (!XmlFile::load(path, *m_document)) {
        m_document.reset();
        return false;
    }
    m_root = m_current = m_document->RootElement();
    return true;
}

bool XMLLoader::selectRootNode()
{
    m_current = m_root;
    return m_current;
}

bool XMLLoader::GetPointerByNodeName(TiXmlElement* element, const std::string& name, TiXmlElement*& out)
{
    for (; element; element = element->NextSiblingElement()) {
        if (element->ValueStr() == name) {
            out = element;
            return true;
        }
        if (GetPointerByNodeName(element->FirstChildElement(), name, out))
            return true;
    }
    return false;
}

bool XMLLoader::selectNode(const std::string& name)
{
    return GetPointerByNodeName(m_current, name, m_current);
}

std::string XMLLoader::getAttributeFromNode(TiXmlElement* element, const std::string& node,
                                            const std::string& key)
{
    TiXmlElement* found = nullptr;
    if (!GetPointerByNodeName(element, node, found))
        return {};
    const std::string* value = found->Attribute(key);
    return value ? *value : std::string();
}

std::string XMLLoader::getAttribute(const std::string& node, const std::string& key)
{
    return getAttributeFromNode(m_current, node, key);
}

std::string XMLLoader::getText(const std::string& node)
{
    TiXmlElement* found = nullptr;
    if (!GetPointerByNodeName(m_current, node, found))
        return {};
    const char* text = found->GetText();
    return text ? text : std::string();
}

bool XMLLoader::setAttribute(const std::string& node, const std::string& key, const std::string& value)
{
    TiXmlElement* found = nullptr;
    if (!GetPointerByNodeName(m_current, node, found))
        return false;
    found->SetAttribute(key, value);
    return true;
}

bool XMLLoader::deleteAttribute(const std::string& node, const std::string& key)
{
    TiXmlElement* found = nullptr;
    if (!GetPointerByNodeName(m_current, node, found))
        return false;
    found->RemoveAttribute(key);
    return true;
}

bool XMLLoader::save(const std::string& path)
{
    return m_document && XmlFile::save(*m_document, path);
}

bool XMLLoader::createEmptyXML(const std::string& path)
{
    m_document = std::make_unique<TiXmlDocument>();
    m_document->LinkEndChild(new TiXmlDeclaration("1.0", "utf-8", ""));
    m_root = m_current = new TiXmlElement("root");
    m_document->LinkEndChild(m_root);
    return save(path);
}
