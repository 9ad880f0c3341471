#pragma once

#include <QString>
#include <QStringList>

#include <vector>

// Compares a batch of titles, four pictures each, with other programs that draw titles: melt, rsvg-convert
// and Qt alone, on one processor and on two. Programs that are not installed are left out.
class PeerComparison
{
public:
    static constexpr int REPETITIONS = 3;

    // The folder is empty, and takes the titles and their pictures.
    explicit PeerComparison(const QString& folder);

    // Runs all programs several times and prints their times. Returns false when one has failed.
    bool run();

    // Returns the results as a table of a document.
    QStringList table() const;

private:
    // A program of the comparison. Its commands make the pictures of the titles from first up to end, one
    // after the other.
    struct Program {
        QString name;
        QString remark;
        QStringList (*pictures)(const QString& folder, int number); // that a title must have afterwards
        std::vector<QStringList> (*commands)(const QString& folder, int first, int end);
        bool usesAllProcessors = false; // by itself; others run once on each processor
    };
    struct Cost {
        double processor = 0; // seconds
        double wall = 0;
        bool isDone = false;
    };

    static std::vector<Program> programs();
    Cost measure(const Program& program, int processors) const;
    bool hasPictures(const Program& program) const;

    QString m_folder;
    std::vector<QStringList> m_rows;
};
