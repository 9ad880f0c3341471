#include "document/LastSettingParser.h"

#include "document/DocumentConstants.h"
#include "document/TitleParserUtility.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/LogManager.h"
#include "support/XmlFile.h"

#include <QString>
#include <tinyxml.h>

namespace
{

constexpr int LOG_NUMBER = 400;

}

LastSettingParser::LastSettingParser(std::string folder)
{
    if (folder.empty())
        folder = FolderLookup::multiByte(&IPathManagerEx::getSystemSettingPath);
    if (!folder.empty())
        m_filePath = folder + TEMP_FILENAME;
}

bool LastSettingParser::createTempFile(const std::string& element, const std::string& attribute,
                                       const std::string& value)
{
    TiXmlDocument document;
    document.LinkEndChild(new TiXmlDeclaration(XML_VERSION, XML_ENCODING, STR_EMPTY));
    auto* root = new TiXmlElement(TEMP_ROOT); // the document owns linked elements
    root->SetAttribute(TEMP_TYPE, TEMP_TYPE_VAL);
    document.LinkEndChild(root);
    auto* entry = new TiXmlElement(element);
    entry->SetAttribute(attribute, value);
    root->LinkEndChild(entry);
    return save(document);
}

bool LastSettingParser::editTempFile(const std::string& element, const std::string& attribute,
                                     const std::string& value)
{
    TiXmlDocument document;
    if (!XmlFile::load(m_filePath, document))
        return createTempFile(element, attribute, value);
    TiXmlElement* root = document.RootElement();
    if (!root)
        return false;
    TiXmlElement* entry = root->FirstChildElement(element);
    if (!entry) {
        entry = new TiXmlElement(element);
        root->LinkEndChild(entry);
    }
    entry->SetAttribute(attribute, value);
    return save(document);
}

// Failures are logged but not shown to the operator: they only mean that the next session starts with another
// title.
bool LastSettingParser::save(const TiXmlDocument& document)
{
    if (m_filePath.empty() || XmlFile::save(document, m_filePath))
        return !m_filePath.empty();
    LOG_DEBUG_OPERATE(L"LastSettingParser", LOG_NUMBER,
                      QString::fromStdString("cannot write " + m_filePath).toStdWString());
    return false;
}

std::string LastSettingParser::getTempAttribute(const std::string& element, const std::string& attribute)
{
    TiXmlDocument document;
    if (!XmlFile::load(m_filePath, document) || !document.RootElement())
        return {};
    return TitleParserUtility::getAttribute(document.RootElement()->FirstChildElement(element), attribute);
}
