#include "bench/PathRecorder.h"

#include <QPaintEngine>
#include <QPainter>

class PathRecorder::Engine : public QPaintEngine
{
public:
    explicit Engine(PathRecorder& recorder) : QPaintEngine(AllFeatures), m_recorder(recorder) {}

    bool begin(QPaintDevice*) override { return true; }
    bool end() override { return true; }
    Type type() const override { return User; }

    void updateState(const QPaintEngineState& changed) override
    {
        const DirtyFlags flags = changed.state();
        if (flags & DirtyTransform)
            m_transform = changed.transform();
        if (flags & DirtyBrush)
            m_brush = changed.brush();
        if (flags & DirtyPen)
            m_pen = changed.pen();
    }

    void drawPath(const QPainterPath& path) override
    {
        if (m_pen.style() != Qt::NoPen || m_brush.style() != Qt::SolidPattern ||
            m_transform.type() > QTransform::TxTranslate)
            m_recorder.m_complete = false;
        m_recorder.m_paths.push_back({path, QPointF(m_transform.dx(), m_transform.dy()), m_brush.color()});
    }

    using QPaintEngine::drawPolygon;
    void drawPixmap(const QRectF&, const QPixmap&, const QRectF&) override { m_recorder.m_complete = false; }
    void drawPolygon(const QPointF*, int, PolygonDrawMode) override { m_recorder.m_complete = false; }
    void drawTextItem(const QPointF&, const QTextItem&) override { m_recorder.m_complete = false; }

private:
    PathRecorder& m_recorder;
    QTransform m_transform;
    QBrush m_brush;
    QPen m_pen;
};

PathRecorder::PathRecorder(QSize size) : m_size(size), m_engine(std::make_unique<Engine>(*this))
{
}

PathRecorder::~PathRecorder() = default;

QPaintEngine* PathRecorder::paintEngine() const
{
    return m_engine.get();
}

int PathRecorder::metric(PaintDeviceMetric metric) const
{
    constexpr int DOTS_PER_INCH = 96;
    constexpr double MILLIMETRES_PER_INCH = 25.4;
    switch (metric) {
    case PdmWidth:
        return m_size.width();
    case PdmHeight:
        return m_size.height();
    case PdmWidthMM:
        return qRound(m_size.width() * MILLIMETRES_PER_INCH / DOTS_PER_INCH);
    case PdmHeightMM:
        return qRound(m_size.height() * MILLIMETRES_PER_INCH / DOTS_PER_INCH);
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
