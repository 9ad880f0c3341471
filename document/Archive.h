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
    std::string getName() const { return mName; }
    void setName(std::string name) { mName = std::move(name); }

    // Full path of the title file.
    std::string getPath() const { return mPath; }
    void setPath(std::string path) { mPath = std::move(path); }

    // One-based position in the folder as decimal text. Not meaningful until a folder reader has set it.
    std::string getOrder() const { return mOrder; }
    void setOrder(std::string order) { mOrder = std::move(order); }

    std::string getVersion() const { return mVersion; }
    void setVersion(std::string version) { mVersion = std::move(version); }
    std::string getCategory() const { return mCategory; }
    void setCategory(std::string category) { mCategory = std::move(category); }

    // Picture file names beside the title file: 240 pixels wide, 240 on black, 1920 and 960 pixels wide. The
    // small one may be an absolute path.
    std::string getThumbnailSmall() const { return mThumbnailSmall; }
    void setThumbnailSmall(std::string name) { mThumbnailSmall = std::move(name); }
    std::string getThumbnailBlack() const { return mThumbnailBlack; }
    void setThumbnailBlack(std::string name) { mThumbnailBlack = std::move(name); }
    std::string getThumbnailBig() const { return mThumbnailBig; }
    void setThumbnailBig(std::string name) { mThumbnailBig = std::move(name); }
    std::string getThumbnailMiddle() const { return mThumbnailMiddle; }
    void setThumbnailMiddle(std::string name) { mThumbnailMiddle = std::move(name); }

    // Background pictures, 1280 and 1920 pixels wide: file names beside the title file, or absolute paths.
    std::string getBgResource() const { return mBgResource; }
    void setBgResource(std::string name) { mBgResource = std::move(name); }
    std::string getBgResourceBig() const { return mBgResourceBig; }
    void setBgResourceBig(std::string name) { mBgResourceBig = std::move(name); }

    // Parameters of the keyer, stored as text.
    std::string getClip() const { return mClip; }
    void setClip(std::string clip) { mClip = std::move(clip); }
    std::string getGain() const { return mGain; }
    void setGain(std::string gain) { mGain = std::move(gain); }
    std::string getDensity() const { return mDensity; }
    void setDensity(std::string density) { mDensity = std::move(density); }

    // Position of the background on the 1280 x 720 canvas, and its z value, which is below those of the text
    // objects.
    float getBgPointX() const { return mBgPointX; }
    void setBgPointX(float x) { mBgPointX = x; }
    float getBgPointY() const { return mBgPointY; }
    void setBgPointY(float y) { mBgPointY = y; }
    float getBgPointZ() const { return mBgPointZ; }
    void setBgPointZ(float z) { mBgPointZ = z; }

    // Returns a copy of the vector; this record keeps ownership of the text objects.
    std::vector<TText*> getText() const { return mText; }

    // Takes ownership of the text objects. Does NOT delete the previous ones: call releaseVectorText() first
    // to replace them.
    void setText(std::vector<TText*> text) { mText = std::move(text); }

    // Returns the same text objects without copying the vector; valid until they are replaced.
    const std::vector<TText*>& text() const { return mText; }

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

    std::string mName;
    std::string mPath;
    std::string mOrder;
    std::string mVersion;
    std::string mCategory;
    std::string mThumbnailSmall;
    std::string mThumbnailBlack;
    std::string mThumbnailBig;
    std::string mThumbnailMiddle;
    std::string mBgResource;
    std::string mBgResourceBig;
    std::string mClip;
    std::string mGain;
    std::string mDensity;
    float mBgPointX;
    float mBgPointY;
    float mBgPointZ;
    std::vector<TText*> mText; // owned
};
