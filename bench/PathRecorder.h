#pragma once

#include <QColor>
#include <QPaintDevice>
#include <QPainterPath>
#include <QSize>
#include <memory>
#include <vector>

class QPaintEngine;

// A paint device that records the paths filled on it instead of drawing them, so that QPainter can draw the
// same paths without the program.
class PathRecorder : public QPaintDevice
{
public:
    struct FilledPath {
        QPainterPath path; // in the coordinates in which it was filled
        QPointF origin;    // in device pixels
        QColor color;
    };

    explicit PathRecorder(QSize size);
    ~PathRecorder() override;

    const std::vector<FilledPath>& paths() const { return m_paths; }
    // Returns whether everything painted could be recorded.
    bool isComplete() const { return m_complete; }

    QPaintEngine* paintEngine() const override;

protected:
    int metric(PaintDeviceMetric metric) const override;

private:
    class Engine;

    QSize m_size;
    std::vector<FilledPath> m_paths;
    bool m_complete = true;
    std::unique_ptr<Engine> m_engine;
};
