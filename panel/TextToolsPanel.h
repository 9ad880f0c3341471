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

// The property panel below the canvas. It keeps a working copy of the style of the selection. When the
// operator uses a tool box, the copy is changed and sent to the canvas with textStyleChange(); a new
// selection on the canvas arrives with updateTextStyle() and is shown without sending anything back.
//
// Sizes are pixels of the 1920 raster, places pixels of the 1280 canvas. GUI thread only.
class TextToolsPanel : public QWidget
{
    Q_OBJECT
public:
    // Offsets of a shadow to each side.
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

    // Called when nothing is selected: disables the boxes, which show the style of the last change.
    void initTextToolsPanel();
    // Sets whether changes are sent to the canvas.
    void setSignalValue(bool enabled);
    void setModuleInfo(SystemSetupDef::emInformationModel model);
    // Sets the default family for new text. Shows it, if it has changed, unless a text is selected.
    void displayInputLanguage(SystemSetupDef::emInputLanguageType language);
    QString defaultFamily() const { return m_defaultFamily; }
    void translateText();

    bool colorPaletteIsShown() const;
    // Shows or hides a mask on the palette.
    void showDialogMaskWidget(bool show);
    void showMessageMaskWidget(bool show);

    bool edgeSliderIsShown() const;
    void hideEdgeSlider();
    void hideFontFamilyComboxList();
    void hideFontSizeComboxList();

    // Returns the working copy; null until the first style arrives.
    const TText* workingStyle() const { return m_style.record(); }

Q_SIGNALS:
    // Emitted when the operator changed the style, which is valid during the call only. undoFlag: 0 for a
    // preview, 1 for a change, 2 when the palette was cancelled.
    void textStyleChange(TText* style, int id, int undoFlag);
    // Reports what the panel shows as the style for a new text object; valid during the call only.
    void signalUpdateCurrentTextProperty(TText& style);
    void sendTitlerWindowRect(QRect rect);
    void signalNotifyEditAreaSizeToolBoxEditDone();
    void signalShowEdgeSlider(bool shown);
    void signalShowFontFamilyComboxList(bool shown);
    void signalShowFontSizeComboxList(bool shown);

public Q_SLOTS:
    // Shows the style of the selection, one TextStyle per character; the caller keeps ownership. A record
    // without characters is ignored.
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
    // Sets which families are offered: with true all, with false the imported ones only.
    void modifyFontFamilyComboxItem(bool isAllItems);
    void slotCanvasSceneMouseTouched();
    void slotHideColorPaletteWhenCloseSoftWare();
    // Called before the selection, its text or the title changes: cancels an open palette and commits the
    // width that an open slider shows.
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
    bool m_changesPass = false; // whether changes are sent to the canvas
    bool m_edgePreview = false;
    QString m_defaultFamily;
    QRect m_titlerWindowRect;
    SystemSetupDef::emInformationModel m_model = SystemSetupDef::emInformationModelDefault;
};
