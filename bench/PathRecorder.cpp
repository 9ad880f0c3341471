#include "bench/PathRecorder.h"

#include <QPaintEngine>
#include <QPainter>

class PathRecorder::Engine : public QPaintEngine
{
public:
    explicit Engine(PathRecorder& recorder) : QPaintEngine(AllFeatures), mRecorder(recorder) {}

    bool begin(QPaintDevice*) override { return true; }
    bool end() override { return true; }
    Type type() const override { return User; }

    void updateState(const QPaintEngineState& changed) override
    {
        const DirtyFlags flags = changed.state();
        if (flags & DirtyTransform)
            mTransform = changed.transform();
        if (flags & DirtyBrush)
            mBrush = changed.brush();
        if (flags & DirtyPen)
            mPen = changed.pen();
    }

    void drawPath(const QPainterPath& path) override
    {
        if (mPen.style() != Qt::NoPen || mBrush.style() != Qt::SolidPattern ||
            mTransform.type() > QTransform::TxTranslate)
            mRecorder.mComplete = false;
        mRecorder.mPaths.push_back({path, QPointF(mTransform.dx(), mTransform.dy()), mBrush.color()});
    }

    using QPaintEngine::drawPolygon;
    void drawPixmap(const QRectF&, const QPixmap&, const QRectF&) override { mRecorder.mComplete = false; }
    void drawPolygon(const QPointF*, int, PolygonDrawMode) override { mRecorder.mComplete = false; }
    void drawTextItem(const QPointF&, const QTextItem&) override { mRecorder.mComplete = false; }

private:
    PathRecorder& mRecorder;
    QTransform mTransform;
    QBrush mBrush;
    QPen mPen;
};

PathRecorder::PathRecorder(QSize size) : mSize(size), mEngine(std::make_unique<Engine>(*this))
{
}

PathRecorder::~PathRecorder() = default;

QPaintEngine* PathRecorder::paintEngine() const
{
    return mEngine.get();
}

int PathRecorder::metric(PaintDeviceMetric metric) const
{
    constexpr int DOTS_PER_INCH = 96;
    constexpr double MILLIMETRES_PER_INCH = 25.4;
    switch (metric) {
    case PdmWidth:
        return mSize.width();
    case PdmHeight:
        return mSize.height();
    case PdmWidthMM:
        return qRound(mSize.width() * MILLIMETRES_PER_INCH / DOTS_PER_INCH);
    case PdmHeightMM:
        return qRound(mSize.height() * MILLIMETRES_PER_INCH / DOTS_PER_INCH);
    case PdmDpiX:
    case PdmDpiY:
    case PdmPhysicalDpiX:
    case PdmPhysicalDpiY:
        return DOTS_PER_INCH;
    case PdmDepth:
        return 32;
    case PdmDevicePixelRatio:
        return 1;
    case PdmDevicePixelRatioScaled:
        return qRound(devicePixelRatioFScale());
    default:
        return QPaintDevice::metric(metric);
    }
}
