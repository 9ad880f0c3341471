#include "document/SettingManager.h"

#include "document/DocumentConstants.h"
#include "document/FontStyle.h"
#include "document/TitleParserUtility.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/XmlFile.h"

#include <tinyxml.h>

SettingManager::SettingManager()
{
    const std::string folder = FolderLookup::multiByte(&IPathManagerEx::getSystemSettingPath);
    if (!folder.empty())
        m_filePath = folder + SETTING_FILENAME;
}

int SettingManager::loadLastTextParameter(FontStyle* style)
{
    TiXmlDocument document;
    if (!style || m_filePath.empty() || !XmlFile::load(m_filePath, document) || !document.RootElement())
        return 0;
    TiXmlElement* element = document.RootElement()->FirstChildElement(SETTING_FONT_STYLE);
    return element ? getFontStyle(element, style) : 0;
}

int SettingManager::saveLastTextParameter(FontStyle* style)
{
    if (!style || m_filePath.empty())
        return 0;
    TiXmlDocument document;
    document.LinkEndChild(new TiXmlDeclaration(XML_VERSION, XML_ENCODING, STR_EMPTY));
    auto* root = new TiXmlElement(SETTING_ROOT); // the document owns linked elements
    root->SetAttribute(SETTING_TYPE, SETTING_TYPE_VAL);
    document.LinkEndChild(root);
    auto* element = new TiXmlElement(SETTING_FONT_STYLE);
    setFontStyle(element, style);
    root->LinkEndChild(element);
    return XmlFile::save(document, m_filePath) ? 1 : 0;
}

int SettingManager::resetTextParameter()
{
    FontStyle style;
    loadLastTextParameter(&style);
    saveLastTextParameter(&style);
    return 1;
}

std::wstring SettingManager::getImportFontsPath()
{
    return FolderLookup::wide(&IPathManagerEx::getFontsPath);
}

std::string SettingManager::getAttribute(TiXmlElement* element, std::string key)
{
    return TitleParserUtility::getAttribute(element, key);
}

int SettingManager::getIntAttribute(TiXmlElement* element, std::string key)
{
    return TitleParserUtility::getIntAttribute(element, key);
}

int SettingManager::getFontStyle(TiXmlElement* element, FontStyle* style)
{
    style->setFamily(getAttribute(element, SETTING_FONT_FAMILY));
    style->setSize(getIntAttribute(element, SETTING_FONT_SIZE));
    style->setColor(getAttribute(element, SETTING_FONT_COLOR));
    style->setBold(getIntAttribute(element, SETTING_FONT_BOLD));
    style->setItalic(getIntAttribute(element, SETTING_FONT_ITALIC));
    style->setKerning(getIntAttribute(element, SETTING_FONT_KERNING));
    style->setAlign(getIntAttribute(element, SETTING_FONT_ALIGN));
    style->setShadowStyle(getIntAttribute(element, SETTING_FONT_SHADOW));
    TShadow shadow;
    shadow.setShadowColor(getAttribute(element, SETTING_FONT_SHADOW_COLOR));
    shadow.setShadowDirectionX(getIntAttribute(element, SETTING_FONT_SHADOW_DIRECTION_X));
    shadow.setShadowDirectionY(getIntAttribute(element, SETTING_FONT_SHADOW_DIRECTION_Y));
    // Only integer radii are stored, although the record has a double.
    shadow.setShadowBlurRadius(TitleParserUtility::truncated(
        TitleParserUtility::getDoubleAttribute(element, SETTING_FONT_SHADOW_BLUR_RADIUS)));
    style->setShadowPoint(shadow);
    style->setEdge(getIntAttribute(element, SETTING_FONT_EDGE));
    TEdge edge;
    edge.setEdgeWidth(getIntAttribute(element, SETTING_FONT_EDGE_WIDTH));
    edge.setEdgeColor(getAttribute(element, SETTING_FONT_EDGE_COLOR));
    style->setEdgePoint(edge);
    return 1;
}

int SettingManager::setFontStyle(TiXmlElement* element, FontStyle* style)
{
    const TShadow& shadow = *style->getShadowPoint();
    const TEdge& edge = *style->getEdgePoint();
    element->SetAttribute(SETTING_FONT_FAMILY, style->getFamily().c_str());
    element->SetAttribute(SETTING_FONT_SIZE, style->getSize());
    element->SetAttribute(SETTING_FONT_COLOR, style->getColor().c_str());
    element->SetAttribute(SETTING_FONT_BOLD, style->getBold());
    element->SetAttribute(SETTING_FONT_ITALIC, style->getItalic());
    element->SetAttribute(SETTING_FONT_KERNING, style->getKerning());
    element->SetAttribute(SETTING_FONT_ALIGN, style->getAlign());
    element->SetAttribute(SETTING_FONT_SHADOW, style->getShadowStyle());
    element->SetAttribute(SETTING_FONT_SHADOW_COLOR, shadow.getShadowColor().c_str());
    element->SetAttribute(SETTING_FONT_SHADOW_DIRECTION_X, shadow.getShadowDirectionX());
    element->SetAttribute(SETTING_FONT_SHADOW_DIRECTION_Y, shadow.getShadowDirectionY());
    element->SetAttribute(SETTING_FONT_SHADOW_BLUR_RADIUS,
                          TitleParserUtility::truncated(shadow.getShadowBlurRadius()));
    element->SetAttribute(SETTING_FONT_EDGE, style->getEdge());
    element->SetAttribute(SETTING_FONT_EDGE_WIDTH, edge.getEdgeWidth());
    element->SetAttribute(SETTING_FONT_EDGE_COLOR, edge.getEdgeColor().c_str());
    return 1;
}
