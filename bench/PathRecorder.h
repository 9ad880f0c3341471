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

    const std::vector<FilledPath>& paths() const { return mPaths; }
    // Returns whether everything painted could be recorded.
    bool isComplete() const { return mComplete; }

    QPaintEngine* paintEngine() const override;

protected:
    int metric(PaintDeviceMetric metric) const override;

private:
    class Engine;

    QSize mSize;
    std::vector<FilledPath> mPaths;
    bool mComplete = true;
    std::unique_ptr<Engine> mEngine;
};
