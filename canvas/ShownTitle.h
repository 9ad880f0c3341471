#pragma once

#include <QString>
#include <memory>

class Archive;
class CanvasController;
class GraphicsPixmap;
class IThumbnailRender;
class TextObjectList;

// The copy of the title that the canvas shows: writes its file and asks for its pictures. GUI thread only.
class ShownTitle
{
public:
    // Takes the picture maker over; null: no pictures are made and isEditFinish() is always true.
    explicit ShownTitle(std::unique_ptr<IThumbnailRender> render);
    ~ShownTitle();
    ShownTitle(const ShownTitle&) = delete;
    ShownTitle& operator=(const ShownTitle&) = delete;

    // Null while no title is shown.
    Archive* archive() const { return m_archive.get(); }
    // Keeps a copy; the copy itself stays as it is.
    void show(const Archive& archive);
    // Nothing is saved; a later save writes nothing.
    void forget();

    // Writes the texts and the place of the background (null: none), and makes the small picture. Returns
    // false when there is nothing to be saved.
    bool save(const TextObjectList& texts, const GraphicsPixmap* background);

    // The pictures are out of date.
    void setPicturesNeeded() { m_picturesNeeded = true; }
    // Makes the pictures if they are out of date.
    void makeNeededPictures();
    // Makes them if one is missing or older than the title.
    void makeLackingPictures();
    // Makes the small picture at once, the others later.
    void makeSmallPicture();

    bool isEditFinish() const;
    // Blocks until the pictures are written, or none has been written for a long time because the disk hangs;
    // they are written when it works again. Returns isEditFinish().
    bool waitForPictures() const;

    // Call when a folder was renamed: what is still to be saved in it is saved there. Returns whether it is
    // the folder of the title shown.
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
