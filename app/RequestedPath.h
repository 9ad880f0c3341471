#pragma once

#include <QString>

// Finds out what the path of an edit request leads to. Only folders of titles and the titles in them can be
// opened: files elsewhere must not be changed or cleaned up. The constructor reads the disk; what changes
// there later is not noticed. GUI thread.
class RequestedPath
{
public:
    enum class Target {
        Choice, // the path is empty: the operator chooses the folder
        Folder,
        Title,
        Missing,
        Outside // the path leads out of the folders of titles, directly or by a link
    };

    explicit RequestedPath(const QString& path);

    Target target() const { return m_target; }
    // Returns whether the window is to be shown for this path.
    bool canBeOpened() const { return m_target != Target::Missing && m_target != Target::Outside; }

    // Return the two parts of the path of a title.
    QString folder() const;
    QString fileName() const;

private:
    Target find() const;

    QString m_path;
    Target m_target;
};
