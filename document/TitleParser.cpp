#include "document/TitleParser.h"

#include "document/Archive.h"
#include "document/DocumentConstants.h"
#include "document/FolderOrder.h"
#include "document/FolderTitles.h"
#include "document/TText.h"
#include "document/TitleParserUtility.h"
#include "support/AtomicFile.h"
#include "support/Utf8.h"
#include "support/XmlFile.h"

#include <algorithm>
#include <array>
#include <memory>
#include <stdexcept>
#include <string_view>
#include <tinyxml.h>
#include <utility>

namespace
{

// Fields of a text item. A title may have a thousand items of eleven attributes, so the attributes of an
// element are read in one pass instead of being searched one by one.
enum class ItemField {
    Text,
    Font,
    Size,
    Color,
    Bold,
    Kerning,
    Italic,
    Edge,
    DefaultFont,
    EdgeWidth,
    EdgeColor,
    None
};

constexpr std::array<std::string_view, 11> ITEM_FIELDS = {
    TitleParser::META_TEXT_OBJ_ITEM_TEXT, TitleParser::META_TEXT_FONT,  TitleParser::META_TEXT_SIZE,
    TitleParser::META_TEXT_COLOR,         TitleParser::META_TEXT_BOLD,  TitleParser::META_TEXT_KERNING,
    TitleParser::META_TEXT_ITALIC,        TitleParser::META_TEXT_EDGE,  TitleParser::META_TEXT_DEFAULT_FONT,
    TitleParser::META_EDGE_WIDTH,         TitleParser::META_EDGE_COLOR,
};

// Returns the field of an attribute name. Files list the attributes in the order of the table, so the
// expected next field is tried first.
ItemField itemField(const std::string& name, std::size_t& expected)
{
    for (std::size_t tried = 0; tried < ITEM_FIELDS.size(); ++tried) {
        const std::size_t index = (expected + tried) % ITEM_FIELDS.size();
        if (ITEM_FIELDS[index] == name) {
            expected = index + 1;
            return static_cast<ItemField>(index);
        }
    }
    return ItemField::None;
}

void setDouble(TiXmlElement* element, const char* key, double value)
{
    element->SetAttribute(key, TitleParserUtility::fromDouble(value).c_str());
}

bool isControl(std::string_view text, std::size_t index)
{
    const auto c = static_cast<unsigned char>(text[index]);
    return c < 0x20 && c != '\t' && c != '\n' && c != '\r';
}

// Returns whether the bytes at index are U+FFFE or U+FFFF.
bool isNonCharacter(std::string_view text, std::size_t index)
{
    const std::string_view bytes = text.substr(index, 3);
    return bytes == "\xEF\xBF\xBE" || bytes == "\xEF\xBF\xBF";
}

// Replaces bytes that XML cannot contain by U+FFFD, one per character, so that the number of characters stays
// the same. A keyboard may send any character, and a file without an encoding may contain invalid bytes;
// written as they are, they would make the file unreadable for all processes.
std::string writable(const std::string& text)
{
    static constexpr std::string_view REPLACEMENT = "\xEF\xBF\xBD";
    std::string result;
    for (std::size_t i = 0; i < text.size();) {
        const std::size_t length = Utf8::lengthAt(text, i);
        if (length == 0 || isControl(text, i) || isNonCharacter(text, i))
            result.append(REPLACEMENT);
        else
            result.append(text, i, length);
        i += std::max<std::size_t>(length, 1);
    }
    return result;
}

bool isWritable(std::string_view text)
{
    for (std::size_t i = 0; i < text.size(); ++i)
        if (isControl(text, i) || isNonCharacter(text, i))
            return false;
    return Utf8::isValid(text);
}

void setText(TiXmlElement* element, const char* key, const std::string& value)
{
    element->SetAttribute(key, isWritable(value) ? value.c_str() : writable(value).c_str());
}

} // namespace

std::string TitleParser::getAttribute(TiXmlElement* element, std::string key)
{
    return TitleParserUtility::getAttribute(element, key);
}

int TitleParser::getIntAttribute(TiXmlElement* element, std::string key)
{
    return TitleParserUtility::getIntAttribute(element, key);
}

double TitleParser::getDoubleAttribute(TiXmlElement* element, std::string key)
{
    return TitleParserUtility::getDoubleAttribute(element, key);
}

bool TitleParser::getNodePointerByName(TiXmlElement* start, const std::string& name, TiXmlElement*& out)
{
    if (!start)
        return false;
    if (start->ValueStr() == name) {
        out = start;
        return true;
    }
    for (TiXmlElement* child = start->FirstChildElement(); child; child = child->NextSiblingElement())
        if (getNodePointerByName(child, name, out))
            return true;
    return false;
}

int TitleParser::writeOneTitle(Archive* archive)
{
    if (!archive || archive->getPath().empty())
        return 0;
    return AtomicFile::write(archive->getPath(), toBytes(*archive)) ? 1 : -1;
}

std::string TitleParser::toBytes(const Archive& archive)
{
    TiXmlDocument document;
    document.LinkEndChild(new TiXmlDeclaration(XML_VERSION, XML_ENCODING, STR_EMPTY));
    auto* root = new TiXmlElement(TITLE_NODE_ROOT); // the document owns linked elements
    writeMetaRoot(root, archive);
    document.LinkEndChild(root);
    auto* background = new TiXmlElement(NODE_BG);
    writeMetaBackground(background, archive);
    root->LinkEndChild(background);
    auto* metaText = new TiXmlElement(NODE_TEXT_OBJ);
    writeMetaText(metaText, archive);
    root->LinkEndChild(metaText);
    return XmlFile::toBytes(document);
}

int TitleParser::writeMetaRoot(TiXmlElement* root, const Archive& archive)
{
    root->SetAttribute(META_TYPE, META_TYPE_VAL_ARCHIVE);
    setText(root, META_VERSION, archive.getVersion());
    setText(root, META_THUMBNAIL, archive.getThumbnailSmall());
    setText(root, META_THUMBNAIL_BLACK, archive.getThumbnailBlack());
    setText(root, META_THUMBNAIL_BIG, archive.getThumbnailBig());
    setText(root, META_THUMBNAIL_MID, archive.getThumbnailMiddle());
    setText(root, META_CLIP, archive.getClip());
    setText(root, META_GAIN, archive.getGain());
    setText(root, META_DENSITY, archive.getDensity());
    return 1;
}

int TitleParser::writeMetaBackground(TiXmlElement* background, const Archive& archive)
{
    setText(background, META_BG_RESOURCE, archive.getBgResource());
    setText(background, META_BG_RESOURCE_BIG, archive.getBgResourceBig());
    setDouble(background, META_BG_POSITION_X, archive.getBgPointX());
    setDouble(background, META_BG_POSITION_Y, archive.getBgPointY());
    setDouble(background, META_BG_POSITION_Z, archive.getBgPointZ());
    return 1;
}

int TitleParser::writeMetaText(TiXmlElement* metaText, const Archive& archive)
{
    metaText->SetAttribute(META_TEXT_OBJ_COUNT, static_cast<int>(archive.text().size()));
    for (const TText* text : archive.text()) {
        auto* content = new TiXmlElement(NODE_TEXT_OBJ_CONTENT);
        writeMetaTextObject(content, text); // a null text object leaves an empty element
        metaText->LinkEndChild(content);
    }
    return 1;
}

int TitleParser::writeMetaTextObject(TiXmlElement* content, const TText* text)
{
    if (!text)
        return 0;
    setText(content, META_TEXT_OBJ_TEXT, text->getText());
    content->SetAttribute(META_TEXT_OBJ_ID, text->getTextObjectID());
    setDouble(content, META_TEXT_OBJ_POS_X, text->getXValue());
    setDouble(content, META_TEXT_OBJ_POS_Y, text->getYValue());
    setDouble(content, META_TEXT_OBJ_POS_Z, text->getZValue());
    content->SetAttribute(META_TEXT_OBJ_ALIGN, text->getTextAlign());
    content->SetAttribute(META_TEXT_OBJ_SHADOW, text->getShadowStyle());
    writeShadowValue(content, *text);
    writeTextItemsValue(content, *text);
    return 1;
}

int TitleParser::writeShadowValue(TiXmlElement* content, const TText& text)
{
    const TShadow& shadow = *text.getTextShadow();
    setText(content, META_SHADOW_COLOR, shadow.getShadowColor());
    content->SetAttribute(META_SHADOW_DIRECTION_X, shadow.getShadowDirectionX());
    content->SetAttribute(META_SHADOW_DIRECTION_Y, shadow.getShadowDirectionY());
    // Other programs of the appliance expect an integer here.
    content->SetAttribute(META_SHADOW_BLUR_RADIUS,
                          TitleParserUtility::truncated(shadow.getShadowBlurRadius()));
    return 1;
}

int TitleParser::writeTextItemsValue(TiXmlElement* content, const TText& text)
{
    content->SetAttribute(META_TEXT_OBJ_ITEM_COUNT, static_cast<int>(text.textItems().size()));
    for (const TextStyle* style : text.textItems()) {
        if (!style)
            continue;
        auto* item = new TiXmlElement(NODE_TEXT_OBJ_ITEM);
        writeMetaTextItem(item, *style);
        content->LinkEndChild(item);
    }
    return 1;
}

int TitleParser::writeMetaTextItem(TiXmlElement* item, const TextStyle& style)
{
    setText(item, META_TEXT_OBJ_ITEM_TEXT, style.getText());
    setText(item, META_TEXT_FONT, style.getFontFamily());
    item->SetAttribute(META_TEXT_SIZE, style.getFontSize());
    setText(item, META_TEXT_COLOR, style.getFontColor());
    item->SetAttribute(META_TEXT_BOLD, style.isFontBold());
    item->SetAttribute(META_TEXT_KERNING, style.getTextKerning());
    item->SetAttribute(META_TEXT_ITALIC, style.isTextItalic());
    item->SetAttribute(META_TEXT_EDGE, style.isTextEdge());
    setText(item, META_TEXT_DEFAULT_FONT, style.getAlphaDefaultFontOfInputLanguage());
    item->SetAttribute(META_EDGE_WIDTH, style.textEdge().getEdgeWidth());
    setText(item, META_EDGE_COLOR, style.textEdge().getEdgeColor());
    return 1;
}

int TitleParser::readOneTitle(std::string path, Archive* archive)
{
    TiXmlDocument document;
    if (!archive || !XmlFile::load(path, document))
        return 0;
    archive->setPath(std::move(path));
    const TiXmlElement* root = document.RootElement();
    if (!root)
        return 0;
    readMetaRoot(root, *archive);
    const TiXmlElement* background = root->FirstChildElement(NODE_BG);
    if (!background)
        return 0;
    readMetaBackground(background, *archive);
    const TiXmlElement* metaText = root->FirstChildElement(NODE_TEXT_OBJ);
    if (!metaText)
        return 0;
    readMetaText(metaText, *archive);
    return 1;
}

int TitleParser::readMetaRoot(const TiXmlElement* root, Archive& archive)
{
    archive.setVersion(TitleParserUtility::getAttribute(root, META_VERSION));
    archive.setThumbnailSmall(TitleParserUtility::getAttribute(root, META_THUMBNAIL));
    archive.setThumbnailBlack(TitleParserUtility::getAttribute(root, META_THUMBNAIL_BLACK));
    archive.setThumbnailBig(TitleParserUtility::getAttribute(root, META_THUMBNAIL_BIG));
    archive.setThumbnailMiddle(TitleParserUtility::getAttribute(root, META_THUMBNAIL_MID));
    archive.setClip(TitleParserUtility::getAttribute(root, META_CLIP));
    archive.setGain(TitleParserUtility::getAttribute(root, META_GAIN));
    archive.setDensity(TitleParserUtility::getAttribute(root, META_DENSITY));
    return 1;
}

int TitleParser::readMetaBackground(const TiXmlElement* background, Archive& archive)
{
    archive.setBgResource(TitleParserUtility::getAttribute(background, META_BG_RESOURCE));
    archive.setBgResourceBig(TitleParserUtility::getAttribute(background, META_BG_RESOURCE_BIG));
    archive.setBgPointX(
        static_cast<float>(TitleParserUtility::getDoubleAttribute(background, META_BG_POSITION_X)));
    archive.setBgPointY(
        static_cast<float>(TitleParserUtility::getDoubleAttribute(background, META_BG_POSITION_Y)));
    archive.setBgPointZ(
        static_cast<float>(TitleParserUtility::getDoubleAttribute(background, META_BG_POSITION_Z)));
    return 1;
}

int TitleParser::readMetaText(const TiXmlElement* metaText, Archive& archive)
{
    const TiXmlElement* content = metaText->FirstChildElement(NODE_TEXT_OBJ_CONTENT);
    if (!content)
        return 0;
    std::vector<TText*> texts;
    for (; content; content = content->NextSiblingElement(NODE_TEXT_OBJ_CONTENT)) {
        auto text = std::make_unique<TText>();
        if (readMetaTextObject(content, *text) == 1)
            texts.push_back(text.release());
    }
    archive.setText(std::move(texts));
    return 1;
}

int TitleParser::readMetaTextObject(const TiXmlElement* content, TText& text)
{
    std::string value = TitleParserUtility::getAttribute(content, META_TEXT_OBJ_TEXT);
    if (value.empty())
        return 0;
    text.setText(std::move(value));
    text.setXValue(static_cast<float>(TitleParserUtility::getDoubleAttribute(content, META_TEXT_OBJ_POS_X)));
    text.setYValue(static_cast<float>(TitleParserUtility::getDoubleAttribute(content, META_TEXT_OBJ_POS_Y)));
    text.setZValue(static_cast<float>(TitleParserUtility::getDoubleAttribute(content, META_TEXT_OBJ_POS_Z)));
    text.setTextObjectID(TitleParserUtility::getIntAttribute(content, META_TEXT_OBJ_ID));
    text.setTextAlign(TitleParserUtility::getIntAttribute(content, META_TEXT_OBJ_ALIGN));
    text.setShadowStyle(TitleParserUtility::getIntAttribute(content, META_TEXT_OBJ_SHADOW));
    readShadowValue(content, text);
    const TiXmlElement* firstItem = content->FirstChildElement(NODE_TEXT_OBJ_ITEM);
    return firstItem ? readTextItemsValue(firstItem, text) : 0;
}

int TitleParser::readShadowValue(const TiXmlElement* content, TText& text)
{
    TShadow shadow;
    shadow.setShadowColor(TitleParserUtility::getAttribute(content, META_SHADOW_COLOR));
    shadow.setShadowDirectionX(TitleParserUtility::getIntAttribute(content, META_SHADOW_DIRECTION_X));
    shadow.setShadowDirectionY(TitleParserUtility::getIntAttribute(content, META_SHADOW_DIRECTION_Y));
    shadow.setShadowBlurRadius(TitleParserUtility::getDoubleAttribute(content, META_SHADOW_BLUR_RADIUS));
    text.setTextShadow(shadow);
    return 1;
}

int TitleParser::readTextItemsValue(const TiXmlElement* firstItem, TText& text)
{
    std::vector<TextStyle*> styles;
    for (const TiXmlElement* item = firstItem; item; item = item->NextSiblingElement(NODE_TEXT_OBJ_ITEM)) {
        auto style = std::make_unique<TextStyle>();
        readMetaTextItem(item, *style);
        styles.push_back(style.release());
    }
    text.setTextItems(std::move(styles));
    return 1;
}

int TitleParser::readMetaTextItem(const TiXmlElement* item, TextStyle& style)
{
    style.setText(STR_EMPTY);
    style.setFontFamily(STR_EMPTY);
    style.setFontColor(STR_EMPTY);
    style.setFontSize(0);
    style.setTextKerning(0);
    TEdge edge;
    edge.setEdgeWidth(0);
    edge.setEdgeColor(STR_EMPTY);

    std::size_t expected = 0;
    for (const TiXmlAttribute* attribute = item->FirstAttribute(); attribute; attribute = attribute->Next()) {
        const std::string& value = attribute->ValueStr();
        switch (itemField(attribute->NameTStr(), expected)) {
        case ItemField::Text:
            style.setText(value);
            break;
        case ItemField::Font:
            style.setFontFamily(value);
            break;
        case ItemField::Size:
            style.setFontSize(TitleParserUtility::toInt(value));
            break;
        case ItemField::Color:
            style.setFontColor(value);
            break;
        case ItemField::Bold:
            style.setFontBold(TitleParserUtility::toInt(value));
            break;
        case ItemField::Kerning:
            style.setTextKerning(TitleParserUtility::toInt(value));
            break;
        case ItemField::Italic:
            style.setIsTextItalic(TitleParserUtility::toInt(value));
            break;
        case ItemField::Edge:
            style.setIsTextEdge(TitleParserUtility::toInt(value));
            break;
        case ItemField::DefaultFont:
            if (!value.empty())
                style.setAlphaDefaultFontOfInputLanguage(value);
            break;
        case ItemField::EdgeWidth:
            edge.setEdgeWidth(TitleParserUtility::toInt(value));
            break;
        case ItemField::EdgeColor:
            edge.setEdgeColor(value);
            break;
        case ItemField::None:
            break;
        }
    }
    style.setTextEdge(std::move(edge));
    return 1;
}

int TitleParser::modifyAttributeValue(const std::string& path, const std::string& key,
                                      const std::string& value)
{
    TiXmlDocument document;
    if (!XmlFile::load(path, document))
        return 0;
    TiXmlElement* root = document.RootElement();
    if (!root)
        return 0;
    setText(root, key.c_str(), value);
    return XmlFile::save(document, path) ? 1 : -1;
}

int TitleParser::modifyProp(KeyDefine::TITLE_PROP_ID_t id, std::string path, std::string value)
{
    switch (id) {
    case KeyDefine::TITLE_PROP_CLIP:
        return modifyClip(std::move(path), std::move(value));
    case KeyDefine::TITLE_PROP_GAIN:
        return modifyGain(std::move(path), std::move(value));
    case KeyDefine::TITLE_PROP_DENSITY:
        return modifyDensity(std::move(path), std::move(value));
    }
    return 0;
}

int TitleParser::modifyClip(std::string path, std::string value)
{
    return modifyAttributeValue(path, META_CLIP, value);
}

int TitleParser::modifyGain(std::string path, std::string value)
{
    return modifyAttributeValue(path, META_GAIN, value);
}

int TitleParser::modifyDensity(std::string path, std::string value)
{
    return modifyAttributeValue(path, META_DENSITY, value);
}

std::vector<ArchiveOrder*> TitleParser::readFileOrderInFolder(std::string folder)
{
    std::vector<ArchiveOrder> rows;
    FolderOrder::read(folder, rows);
    std::vector<ArchiveOrder*> result;
    result.reserve(rows.size());
    for (ArchiveOrder& row : rows)
        result.push_back(new ArchiveOrder(std::move(row)));
    return result;
}

int TitleParser::writeFileOrderInFolder(std::string folder, std::vector<ArchiveOrder> rows)
{
    return FolderOrder::write(folder, rows) ? 1 : -1;
}

std::vector<Archive*> TitleParser::getFilsByOrderInFolder(std::string folder)
{
    const FolderTitles titles(std::move(folder));
    for (std::size_t row = 0; row < titles.count(); ++row)
        if (!titles.canBeTitle(row))
            throw std::out_of_range("a row too short for the name of a title file");
    std::vector<Archive*> result;
    for (std::unique_ptr<Archive>& title : titles.read(0, titles.count()))
        if (title)
            result.push_back(title.release());
    return result;
}

std::vector<Archive*> TitleParser::getFilesByOrderInFolderWithoutCheck(std::string folder)
{
    return getFilsByOrderInFolder(std::move(folder));
}
