#pragma once

#include "touchui/SliceFrame.h"

#include <QMenu>

class KSSLider;
class OutsidePressFilter;
class QLabel;

// The slider for the width of the edge, in a menu that is closed by a press outside it. It is not a Qt popup,
// since a popup would keep touches from the slider.
class EdgeSizeSlider : public QMenu
{
    Q_OBJECT
public:
    static constexpr int EDGELABEL_WIDTH = 72;
    static constexpr int EDGESLIDER_WIDTH = 257;
    static constexpr int EDGESLIDER_HEIGHT = 57;
    static constexpr int SLIDER_RANGE_BEGIN = 1;
    static constexpr int SLIDER_RANGE_END = 10;

    explicit EdgeSizeSlider(QWidget* parent);
    ~EdgeSizeSlider() override;

    // Sets the value, limited to the range, without a signal.
    void setValue(int value);
    int value() const;
    KSSLider* slider() const { return m_slider; }
    void translateText();

Q_SIGNALS:
    // Emitted when the operator has moved the slider.
    void sliderValueSignal(int value);

protected:
    void paintEvent(QPaintEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    QWidget* createContent();
    void drawToolTip();
    void slotSliderMouseRelease();

    KSSLider* m_slider = nullptr;
    QLabel* m_endLabel = nullptr;
    SliceFrame m_frame;
    OutsidePressFilter* m_outsidePress;
};
