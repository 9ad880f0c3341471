#pragma once

#include "document/TEdge.h"
#include "panel/ToolBox.h"

class ColorButton;
class EdgeSizeSlider;

// Sets the edge of the characters: on or off, its width with a slider, its colour with the palette.
class EdgeToolBox : public ToolBox
{
    Q_OBJECT
public:
    static constexpr int EDGELABEL_WIDTH = 84;
    static constexpr int WIDGET_HEIGHT = 48;
    static constexpr int WIDTHBTN_HEIGHT = 50;
    static constexpr int PXLABEL_WIDTH = 37;
    static constexpr int OFFBUTTON_WIDTH = 50;
    static constexpr int ONBUTTON_WIDTH = 50;
    static constexpr int EDGECOLORBUTTON_WIDTH = 50;
    static constexpr int EDGEWIDTHBUTTON_WIDTH = 61;
    static constexpr int EDGEBOX_LAYOUT_SPACING = 0;
    static constexpr int EDGEBOX_LAYOUT_MARGIN = 0;
    static constexpr int SPACING_BEWTEEN_EDGELABEL_AND_OFFBUTTON = 39;
    static constexpr int SPACING_BEWTEEN_ONBUTTON_AND_WIDTHBUTTON = 10;
    static constexpr int SPACING_BEWTEEN_PXLABEL_AND_COLORBUTTON = 0;
    static constexpr int EDGESLIDER_HEIGHT = 75;
    static constexpr int SET_VALUE_ENABLED = 1;
    static constexpr int SET_VALUE_DISABLED = 0;
    static constexpr int DEFAULT_SLIDERVALUE = 2;
    static constexpr int SWITCHSEPARATOR_WIDTH = 3;
    static const QString DEFAULT_COLORVALUE;

    // Which property of the edge a change sets.
    enum Kind { SWITCH = 1, WIDTH = 2, COLOR = 3 };

    explicit EdgeToolBox(QWidget* parent);

    // Shows the edge. preview: the slider is being dragged, so its position is not changed.
    void setEdge(int on, const TEdge& edge, bool preview);
    TEdge getEdge() const { return m_edge; }
    bool isEdgeOn() const { return m_on; }
    QString getColor() const;
    // Called with the answer of the palette: state 0 preview, 1 OK, 2 Cancel.
    void getColorValue(const QString& color, int state);
    QString getRgbaValue(const QString& color) const;

    bool sliderIsShown() const;
    void hideEdgeSliderMenu();
    EdgeSizeSlider* slider() const { return m_slider; }

    void setWidgetEnabled() override;
    void setWidgetDisabled() override;
    void resetInitializeStyle() override;
    void translateText() override;

Q_SIGNALS:
    // Emitted when the operator has changed the edge. undoFlag: 0 for a preview, 1 for an undo step, 2 when
    // the palette was cancelled.
    void edgeChange(int on, TEdge edge, int id, int undoFlag, int kind);
    void signalShowEdgeSlider(bool shown);
    // Emitted when the colour button was tapped.
    void clicked();

private:
    void onEdgeBtnClicked();
    void offEdgeBtnClicked();
    void switchEdge(bool on);
    void edgeWidthBtnClicked();
    void getSliderValueBeforeChanged();
    void edgeWidthChangedForPreview(int value);
    void edgeWidthChangedForSave();
    void showSwitch();
    void showWidth();
    void showColor();

    QLabel* m_label = nullptr;
    KSPushbutton* m_offButton = nullptr;
    KSPushbutton* m_onButton = nullptr;
    KSPushbutton* m_widthButton = nullptr;
    QLabel* m_pxLabel = nullptr;
    ColorButton* m_colorButton = nullptr;
    EdgeSizeSlider* m_slider = nullptr;
    TEdge m_edge;
    bool m_on = false;
    int m_valueBeforeDrag = DEFAULT_SLIDERVALUE;
};
