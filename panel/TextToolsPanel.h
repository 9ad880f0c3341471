#pragma once

#include "document/TText.h"
#include "messaging/services/SystemSetupDef.h"
#include "panel/PanelPalette.h"
#include "panel/PropertyBoxes.h"
#include "panel/TextToolsPanelController.h"
#include "panel/WorkingStyle.h"

#include <QList>
#include <QRect>
#include <QString>
#include <QWidget>
#include <string>

// The property panel under the canvas. It keeps a working copy of the style of what is selected. A tool box
// that the operator uses changes the copy, which goes to the canvas with textStyleChange; what the canvas
// selects comes back with updateTextStyle and is shown without an answer.
//
// Sizes are pixels of the 1920 raster, places pixels of the 1280 canvas. GUI thread only.
class TextToolsPanel : public QWidget
{
    Q_OBJECT
public:
    // Directions of a shadow.
    static constexpr int LEFT_X = -WorkingStyle::SHADOW_OFFSET;
    static constexpr int RIGHT_X = WorkingStyle::SHADOW_OFFSET;
    static constexpr int UP_Y = -WorkingStyle::SHADOW_OFFSET;
    static constexpr int DOWN_Y = WorkingStyle::SHADOW_OFFSET;
    static constexpr int FONT_SIZE = 12;
    static constexpr int ROW_SPACING = 22;
    static constexpr int TEXTTOOL_LAYOUT_SPACING = 0;
    static constexpr int USELESS_INT = 100;
    static const QString EMPTY;
    static const QString USELESS_STR;
    static const QString FONT_DEFAULT_COLOR;
    static const QString SHADOW_DEFAULT_COLOR;

    explicit TextToolsPanel(QWidget* parent);
    ~TextToolsPanel() override;

    // Nothing is selected: the boxes are disabled and show the style that the last change left.
    void initTextToolsPanel();
    // Whether changes reach the canvas.
    void setSignalValue(bool enabled);
    void setModuleInfo(SystemSetupDef::emInformationModel model);
    // Sets the family that a text without one gets; shows it, when it is another one, unless a text is
    // selected.
    void displayInputLanguage(SystemSetupDef::emInputLanguageType language);
    QString defaultFamily() const { return m_defaultFamily; }
    void translateText();

    bool colorPaletteIsShown() const;
    // Masks on the palette.
    void showDialogMaskWidget(bool show);
    void showMessageMaskWidget(bool show);

    bool edgeSliderIsShown() const;
    void hideEdgeSlider();
    void hideFontFamilyComboxList();
    void hideFontSizeComboxList();

    // The working copy, null until the first style arrives.
    const TText* workingStyle() const { return m_style.record(); }

Q_SIGNALS:
    // The style is valid during the call only. undoFlag: 0 a preview, 1 a change, 2 a cancelled palette.
    void textStyleChange(TText* style, int id, int undoFlag);
    // What the panel shows, for a new text object; valid during the call only.
    void signalUpdateCurrentTextProperty(TText& style);
    void sendTitlerWindowRect(QRect rect);
    void signalNotifyEditAreaSizeToolBoxEditDone();
    void signalShowEdgeSlider(bool shown);
    void signalShowFontFamilyComboxList(bool shown);
    void signalShowFontSizeComboxList(bool shown);

public Q_SLOTS:
    // The style of what is selected, one TextStyle a character; the caller keeps it. A record without
    // characters is ignored.
    void updateTextStyle(TText* style);

    void changeFamily(QString family, int id);
    void changeSize(QList<int> sizes, int id);
    void changeBold(int bold, int id);
    void changeItalic(int italic, int id);
    void changeEdge(int on, TEdge edge, int id, int undoFlag, int kind);
    void changeShadow(int style, int id);
    void changeAlign(int align, int id);
    void changeKerning(int index, int id);
    void changeTextColor(QString color, int id, int state);
    void changeMoveRange(int range, int direction, int id);

    void changeFontPropertyBtnStatus(bool enabled);
    void selectionModeForShadowAndAlign(bool shadowAlign, bool move);
    void slotBeginNewTextItem();
    void showFontColorPalette();
    void showEdgeColorPalette();
    void getColorValue(QString color, int state);
    void titlerWindowRectSlot(QRect rect);
    void slotImportNewFontFamlies(QString file);
    // True offers all families, false the imported ones.
    void modifyFontFamilyComboxItem(bool isAllItems);
    void slotCanvasSceneMouseTouched();
    void slotHideColorPaletteWhenCloseSoftWare();
    // The selection, its text or the title is about to change: an open palette is cancelled, and the width
    // that an open slider shows is committed.
    void slotEndPreview();
    void slotClearSizeBoxLineEditFocus(bool clear);
    void slotShowFontFamilyComboxList(bool shown);
    void slotAbsoluteShowCanvasMenu(bool shown);

private:
    void createConnection();
    template <typename Edit>
    void change(const std::wstring& log, int id, int undoFlag, Edit edit);
    void editEdge(int on, const TEdge& edge, int undoFlag, int kind);
    void showPalette(PanelPalette::Owner owner, const QString& color);

    PropertyBoxes m_boxes;
    PanelPalette m_palette;
    TextToolsPanelController m_controller;
    WorkingStyle m_style;
    bool m_changesPass = false; // to the canvas
    bool m_edgePreview = false;
    QString m_defaultFamily;
    QRect m_titlerWindowRect;
    SystemSetupDef::emInformationModel m_model = SystemSetupDef::emInformationModelDefault;
};
