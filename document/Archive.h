#pragma once

#include <QString>
#include <string>
#include <utility>
#include <vector>

class TText;

// Holds one title in memory: its path, its pictures, its background and its text objects. Strings are UTF-8.
// The creator of an Archive owns it; a copy is deep. Not synchronised: a worker thread gets a copy of its
// own.
class Archive
{
public:
    Archive();
    Archive(const Archive& other);
    Archive& operator=(const Archive& other);
    ~Archive();

    // File name of the title without ".xml".
    std::string getName() const { return m_name; }
    void setName(std::string name) { m_name = std::move(name); }

    // Full path of the title file.
    std::string getPath() const { return m_path; }
    void setPath(std::string path) { m_path = std::move(path); }

    // One-based position in the folder as decimal text. Not meaningful until a folder reader has set it.
    std::string getOrder() const { return m_order; }
    void setOrder(std::string order) { m_order = std::move(order); }

    std::string getVersion() const { return m_version; }
    void setVersion(std::string version) { m_version = std::move(version); }
    std::string getCategory() const { return m_category; }
    void setCategory(std::string category) { m_category = std::move(category); }

    // Picture file names beside the title file: 240 pixels wide, 240 on black, 1920 and 960 pixels wide. The
    // small one may be an absolute path.
    std::string getThumbnailSmall() const { return m_thumbnailSmall; }
    void setThumbnailSmall(std::string name) { m_thumbnailSmall = std::move(name); }
    std::string getThumbnailBlack() const { return m_thumbnailBlack; }
    void setThumbnailBlack(std::string name) { m_thumbnailBlack = std::move(name); }
    std::string getThumbnailBig() const { return m_thumbnailBig; }
    void setThumbnailBig(std::string name) { m_thumbnailBig = std::move(name); }
    std::string getThumbnailMiddle() const { return m_thumbnailMiddle; }
    void setThumbnailMiddle(std::string name) { m_thumbnailMiddle = std::move(name); }

    // Background pictures, 1280 and 1920 pixels wide: file names beside the title file, or absolute paths.
    std::string getBgResource() const { return m_bgResource; }
    void setBgResource(std::string name) { m_bgResource = std::move(name); }
    std::string getBgResourceBig() const { return m_bgResourceBig; }
    void setBgResourceBig(std::string name) { m_bgResourceBig = std::move(name); }

    // Parameters of the keyer, stored as text.
    std::string getClip() const { return m_clip; }
    void setClip(std::string clip) { m_clip = std::move(clip); }
    std::string getGain() const { return m_gain; }
    void setGain(std::string gain) { m_gain = std::move(gain); }
    std::string getDensity() const { return m_density; }
    void setDensity(std::string density) { m_density = std::move(density); }

    // Position of the background on the 1280 x 720 canvas, and its z value, which is below those of the text
    // objects.
    float getBgPointX() const { return m_bgPointX; }
    void setBgPointX(float x) { m_bgPointX = x; }
    float getBgPointY() const { return m_bgPointY; }
    void setBgPointY(float y) { m_bgPointY = y; }
    float getBgPointZ() const { return m_bgPointZ; }
    void setBgPointZ(float z) { m_bgPointZ = z; }

    // Returns a copy of the vector; this record keeps ownership of the text objects.
    std::vector<TText*> getText() const { return m_text; }

    // Takes ownership of the text objects. Does NOT delete the previous ones: call releaseVectorText() first
    // to replace them.
    void setText(std::vector<TText*> text) { m_text = std::move(text); }

    // Returns the same text objects without copying the vector; valid until they are replaced.
    const std::vector<TText*>& text() const { return m_text; }

    // Deletes all text objects.
    void releaseVectorText();

    // Returns whether the background is outside the title's folder.
    bool isPreset() const;

    // Return full paths. Null if the title does not have the picture, or if it is outside the folders that a
    // title may refer to (see ConfinedPath).
    QString getFullPathOfThumbnailSmall() const;
    QString getFullPathOfBgResource() const;
    QString getFullPathOfBgResourceBig() const; // absolute if the 1280 wide background is

private:
    void cloneText(const std::vector<TText*>& text);
    std::string folder() const;
    QString besideTitle(const std::string& name) const;
    QString confined(const std::string& path) const;

    std::string m_name;
    std::string m_path;
    std::string m_order;
    std::string m_version;
    std::string m_category;
    std::string m_thumbnailSmall;
    std::string m_thumbnailBlack;
    std::string m_thumbnailBig;
    std::string m_thumbnailMiddle;
    std::string m_bgResource;
    std::string m_bgResourceBig;
    std::string m_clip;
    std::string m_gain;
    std::string m_density;
    float m_bgPointX;
    float m_bgPointY;
    float m_bgPointZ;
    std::vector<TText*> m_text; // owned
};
