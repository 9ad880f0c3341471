#pragma once

#include <QString>
#include <memory>

class Archive;
class CanvasController;
class GraphicsPixmap;
class IThumbnailRender;
class TextObjectList;

// The copy of the title that the canvas shows: writes the title file and has its pictures made. GUI thread
// only.
class ShownTitle
{
public:
    // Takes ownership of the picture maker. With null no pictures are made and isEditFinish() is always true.
    explicit ShownTitle(std::unique_ptr<IThumbnailRender> render);
    ~ShownTitle();
    ShownTitle(const ShownTitle&) = delete;
    ShownTitle& operator=(const ShownTitle&) = delete;

    // Returns the copy, or null while no title is shown.
    Archive* archive() const { return m_archive.get(); }
    // Keeps a copy of the title.
    void show(const Archive& archive);
    // Drops the copy without saving; a later save writes nothing.
    void forget();

    // Writes the texts and the place of the background (null: none), and makes the small picture. Returns
    // false when there is nothing to save.
    bool save(const TextObjectList& texts, const GraphicsPixmap* background);

    // Marks the pictures as out of date.
    void setPicturesNeeded();
    // Makes the pictures if they are out of date.
    void makeNeededPictures();
    // Makes the pictures if one is missing or older than the title.
    void makeLackingPictures();
    // Makes the small picture at once; the others are made later.
    void makeSmallPicture();

    bool isEditFinish() const;
    // Blocks until the pictures are written, or none has been written for a long time because the disk hangs;
    // they are written when it works again. Returns isEditFinish().
    bool waitForPictures() const;

    // Call when a folder was renamed: pending writes for it go to its new path. Returns whether the title
    // shown is in that folder.
    bool folderRenamed(const QString& before, const QString& after);

private:
    bool writeFile(const TextObjectList& texts, const GraphicsPixmap* background);
    bool lacksPictures() const;
    QString path() const;

    std::unique_ptr<Archive> m_archive;
    std::unique_ptr<CanvasController> m_controller;
    std::unique_ptr<IThumbnailRender> m_render;
    bool m_picturesNeeded = false;
};
