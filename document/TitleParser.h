#pragma once

#include "document/KeyDefine.h"

#include <string>
#include <vector>

class Archive;
class ArchiveOrder;
class TText;
class TextStyle;
class TiXmlElement;

// Reads and writes the title files and the order file of a folder. Stateless: any thread may construct one
// for a job. Errors are reported only by results: 1 success, 0 failure. Missing attributes are read as empty
// or zero, not as the defaults of the records. Files are not locked; see AtomicFile for concurrent reads and
// writes.
class TitleParser
{
public:
    static constexpr char TITLE_NODE_ROOT[] = "manifest";
    static constexpr char META_TYPE[] = "type";
    static constexpr char META_TYPE_VAL_ARCHIVE[] = "archive";
    static constexpr char META_VERSION[] = "version";
    static constexpr char META_THUMBNAIL[] = "thumbnail-small";
    static constexpr char META_THUMBNAIL_BLACK[] = "thumbnail-black";
    static constexpr char META_THUMBNAIL_BIG[] = "thumbnail-big";
    static constexpr char META_THUMBNAIL_MID[] = "thumbnail-mid";
    static constexpr char META_CLIP[] = "clip";
    static constexpr char META_GAIN[] = "gain";
    static constexpr char META_DENSITY[] = "density";

    static constexpr char NODE_BG[] = "meta-bg";
    static constexpr char META_BG_RESOURCE[] = "resource";
    static constexpr char META_BG_RESOURCE_BIG[] = "resource-big";
    static constexpr char META_BG_POSITION_X[] = "position-X";
    static constexpr char META_BG_POSITION_Y[] = "position-Y";
    static constexpr char META_BG_POSITION_Z[] = "position-Z";

    static constexpr char NODE_TEXT_OBJ[] = "meta-text";
    static constexpr char META_TEXT_OBJ_COUNT[] = "content-count";
    static constexpr char NODE_TEXT_OBJ_CONTENT[] = "content";
    static constexpr char META_TEXT_OBJ_TEXT[] = "text";
    static constexpr char META_TEXT_OBJ_ID[] = "id";
    static constexpr char META_TEXT_OBJ_POS_X[] = "position-X";
    static constexpr char META_TEXT_OBJ_POS_Y[] = "position-Y";
    static constexpr char META_TEXT_OBJ_POS_Z[] = "position-Z";
    static constexpr char META_TEXT_OBJ_ALIGN[] = "text-align";
    static constexpr char META_TEXT_OBJ_SHADOW[] = "text-shadow";
    static constexpr char META_SHADOW_COLOR[] = "shadow-color";
    static constexpr char META_SHADOW_DIRECTION_X[] = "shadow-direction-x";
    static constexpr char META_SHADOW_DIRECTION_Y[] = "shadow-direction-y";
    static constexpr char META_SHADOW_BLUR_RADIUS[] = "shadow-blur-radius";
    static constexpr char META_TEXT_OBJ_ITEM_COUNT[] = "item-count";

    static constexpr char NODE_TEXT_OBJ_ITEM[] = "text-item";
    static constexpr char META_TEXT_OBJ_ITEM_TEXT[] = "text";
    static constexpr char META_TEXT_FONT[] = "font";
    static constexpr char META_TEXT_SIZE[] = "size";
    static constexpr char META_TEXT_COLOR[] = "color";
    static constexpr char META_TEXT_BOLD[] = "bold";
    static constexpr char META_TEXT_KERNING[] = "text-kerning";
    static constexpr char META_TEXT_ITALIC[] = "text-italic";
    static constexpr char META_TEXT_EDGE[] = "text-edge";
    static constexpr char META_TEXT_DEFAULT_FONT[] = "default-font";
    static constexpr char META_EDGE_WIDTH[] = "edge-width";
    static constexpr char META_EDGE_COLOR[] = "edge-color";

    static constexpr char ORDER_FILEPATH[] = ".order.xml";
    static constexpr char ORDER_NODE_ROOT[] = "manifest";
    static constexpr char ORDER_TYPE[] = "type";
    static constexpr char ORDER_TYPE_VAL[] = "order";
    static constexpr char ORDER_INDEX_COUNT[] = "index-count";
    static constexpr char ORDER_NODE_INDEX[] = "index";
    static constexpr char ORDER_INDEX_VAL[] = "value";
    static constexpr char ORDER_INDEX_FILEPATH[] = "file-path";

    // Writes the title to the path in its record. Returns 0 for an empty path, and -1, with errno set and the
    // old file unchanged, if writing fails.
    int writeOneTitle(Archive* archive);

    // Returns the bytes of the title's file.
    std::string toBytes(const Archive& archive);

    // Fills the record; if the result is 0 it may be partly filled. Sets neither name nor order. Does not
    // delete text objects that were in the record.
    int readOneTitle(std::string path, Archive* archive);

    // Change root attributes of a title file in place. Return 0 if the file cannot be read, -1 if it cannot
    // be written.
    int modifyProp(KeyDefine::TITLE_PROP_ID_t id, std::string path, std::string value);
    int modifyAttributeValue(const std::string& path, const std::string& key, const std::string& value);
    int modifyClip(std::string path, std::string value);
    int modifyGain(std::string path, std::string value);
    int modifyDensity(std::string path, std::string value);

    // Returns the rows of the folder's order file in document order; empty if it cannot be read. The caller
    // owns them.
    std::vector<ArchiveOrder*> readFileOrderInFolder(std::string folder);

    // Replaces the order file. Returns -1, with the old file unchanged, if writing fails.
    int writeFileOrderInFolder(std::string folder, std::vector<ArchiveOrder> rows);

    // Return the titles of a folder in the order of its order file, without those that cannot be read. The
    // caller owns them. Both functions do the same.
    std::vector<Archive*> getFilsByOrderInFolder(std::string folder);
    std::vector<Archive*> getFilesByOrderInFolderWithoutCheck(std::string folder);

    // Searches depth first by name, beginning with start itself, children in document order.
    bool getNodePointerByName(TiXmlElement* start, const std::string& name, TiXmlElement*& out);

    std::string getAttribute(TiXmlElement* element, std::string key);
    int getIntAttribute(TiXmlElement* element, std::string key);
    double getDoubleAttribute(TiXmlElement* element, std::string key);

private:
    int writeMetaRoot(TiXmlElement* root, const Archive& archive);
    int writeMetaBackground(TiXmlElement* background, const Archive& archive);
    int writeMetaText(TiXmlElement* metaText, const Archive& archive);
    int writeMetaTextObject(TiXmlElement* content, const TText* text);
    int writeShadowValue(TiXmlElement* content, const TText& text);
    int writeTextItemsValue(TiXmlElement* content, const TText& text);
    int writeMetaTextItem(TiXmlElement* item, const TextStyle& style);

    int readMetaRoot(const TiXmlElement* root, Archive& archive);
    int readMetaBackground(const TiXmlElement* background, Archive& archive);
    int readMetaText(const TiXmlElement* metaText, Archive& archive);
    int readMetaTextObject(const TiXmlElement* content, TText& text);
    int readShadowValue(const TiXmlElement* content, TText& text);
    int readTextItemsValue(const TiXmlElement* firstItem, TText& text);
    int readMetaTextItem(const TiXmlElement* item, TextStyle& style);
};
