// A paint device that keeps what is filled on it instead of drawing it, so that the same paths can be drawn
// again by QPainter alone.
#pragma once

#include <QColor>
#include <QPaintDevice>
#include <QPainterPath>
#include <QSize>
#include <memory>
#include <vector>

class QPaintEngine;

class PathRecorder : public QPaintDevice
{
public:
    struct FilledPath {
        QPainterPath path; // in the space it was filled in, with an origin
        QPointF origin;    // in device pixels
        QColor color;
    };

    explicit PathRecorder(QSize size);
    ~PathRecorder() override;

    const std::vector<FilledPath>& paths() const { return mPaths; }
    // Whether all that was painted could be kept.
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
