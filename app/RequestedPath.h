#pragma once

#include <QString>

// Tells what the path of an edit request leads to. Only folders of titles and the titles in them can be
// opened: files elsewhere must not be changed or cleaned up. Looks at the disk when it is made. GUI thread.
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
    // Returns whether there is something for which the window is to be shown.
    bool canBeOpened() const { return m_target != Target::Missing && m_target != Target::Outside; }

    const QString& path() const { return m_path; }
    // The two parts of the path of a title.
    QString folder() const;
    QString fileName() const;

private:
    Target find() const;

    QString m_path;
    Target m_target;
};
