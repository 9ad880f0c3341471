#pragma once

#include <QString>

class QIODevice;
class QJsonDocument;

// What a command says: its result as lines or as one JSON document, messages, and how far it has come.
class Output
{
public:
    enum class Format { Lines, Json };
    enum class Progress { Shown, Hidden };

    // The devices are open, not owned, and outlive this object. Progress goes to the messages.
    Output(QIODevice& result, QIODevice& messages, Format format, Progress progress);
    // Removes what is left of the progress.
    ~Output();
    Output(const Output&) = delete;
    Output& operator=(const Output&) = delete;

    bool isJson() const { return m_format == Format::Json; }
    // Writes a line of the result; does nothing if it is to be JSON.
    void line(const QString& text);
    // Writes the result; does nothing if it is to be lines.
    void json(const QJsonDocument& document);
    // Writes one line, with the name of the program before it.
    void message(const QString& text);
    // Shows that done of total are done; total must be more than 0.
    void progress(int done, int total);

    // Returns a bar of this many characters without a line feed.
    static QString bar(int done, int total, int width);

private:
    void clearProgress();

    QIODevice& m_result;
    QIODevice& m_messages;
    Format m_format;
    Progress m_progress;
    bool m_isProgressOnScreen = false;
};
