#pragma once

#include "document/FontStyle.h"
#include "document/TText.h"
#include "messaging/services/SystemSetupDef.h"
#include "panel/TextToolsPanelController.h"

#include <QList>
#include <QRect>
#include <QString>
#include <QWidget>
#include <memory>
#include <string>

class AlignToolBox;
class BoldToolBox;
class ColorPalette;
class EdgeToolBox;
class FamilyToolBox;
class ItalicToolBox;
class KerningToolBox;
class QHBoxLayout;
class QLayout;
class RangeOfMoveText;
class ShadowToolBox;
class SizeToolBox;
class TextColorToolBox;
class ToolBox;

// The property panel under the canvas. It keeps a working copy of the style of what is selected. A tool box
// that the operator uses changes the copy, which goes to the canvas with textStyleChange; what the canvas
// selects comes back with updateTextStyle and is shown without an answer.
//
// The change path is TextToolsPanelChange.cpp, the reverse path TextToolsPanelShow.cpp. Sizes are pixels of
// the 1920 raster, places pixels of the 1280 canvas. GUI thread only.
class TextToolsPanel : public QWidget
{
    Q_OBJECT
public:
    // Directions of a shadow.
    static constexpr int LEFT_X = -4;
    static constexpr int RIGHT_X = 4;
    static constexpr int UP_Y = -4;
    static constexpr int DOWN_Y = 4;
    static constexpr int FONT_SIZE = 12;
    static constexpr int ROW_SPACING = 22;
    static constexpr int TEXTTOOL_LAYOUT_SPACING = 0;
    static constexpr int USELESS_INT = 100;
    static const QString EMPTY;
    static const QString USELESS_STR;
    static const QString FONT_DEFAULT_COLOR;
    static const QString SHADOW_DEFAULT_COLOR;

    // Whose colour the palette chooses.
    enum PaletteOwner { NO_OWNER = 0, TEXT_COLOR_OWNER = 1, EDGE_COLOR_OWNER = 2 };

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
    const TText* workingStyle() const { return m_style.get(); }

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
    // Building.
    void createToolBoxes();
    void createLayout();
    QLayout* createLeftBlock();
    QLayout* createMiddleBlock();
    void createConnection();
    static const QList<TShadow>& initConstShadowValue();
    static const QList<int>& initConstKerningValue();
    QList<ToolBox*> boxes() const;

    // The change path.
    template <typename Edit>
    void change(const std::wstring& log, int id, int undoFlag, Edit edit);
    template <typename Edit>
    void changeAllItems(const std::wstring& log, int id, int undoFlag, Edit edit);
    static void setEdgeValueForTText(TextStyle& item, int on, const TEdge& edge, int kind);
    void outPutUserLog(int on, const TEdge& edge, int undoFlag, int kind) const;
    static QString changeintValueToString(int value);
    void rememberStyle() const;
    void showPalette(PaletteOwner owner, const QString& color);
    void cancelPaletteOfOthers();
    void saveColorList();

    // The reverse path.
    void setChildWidget();
    void setDisplayedValueForMultiStyle(const TText* style, QString* family, int* bold, int* italic) const;
    void setChildWidgetValue(const QString& family, int bold, int italic);
    void setChildWidgetEnabled();
    void setChildWidgetDisabled();
    void showSelectionMode();
    void showFontStyle(const FontStyle& style);
    TText getTTextStyleForNew() const;

    FamilyToolBox* m_family = nullptr;
    SizeToolBox* m_size = nullptr;
    BoldToolBox* m_bold = nullptr;
    ItalicToolBox* m_italic = nullptr;
    EdgeToolBox* m_edge = nullptr;
    ShadowToolBox* m_shadow = nullptr;
    AlignToolBox* m_align = nullptr;
    KerningToolBox* m_kerning = nullptr;
    TextColorToolBox* m_textColor = nullptr;
    RangeOfMoveText* m_move = nullptr;
    ColorPalette* m_palette = nullptr;

    TextToolsPanelController m_controller;
    std::unique_ptr<TText> m_style;
    TShadow m_workingShadow;
    int m_enabledForChange = 0; // 1 lets changes through
    bool m_mixedFamily = false;
    bool m_mixedBold = false;
    bool m_mixedItalic = false;
    bool m_alignEnabled = false;
    bool m_moveEnabled = false;
    bool m_edgePreview = false;
    int m_paletteOwner = NO_OWNER;
    bool m_paletteAnswers = false; // the change that goes on is the palette's own
    QList<QString> m_savedColors;  // one a character, for Cancel
    QString m_defaultFamily;
    QRect m_titlerWindowRect;
    SystemSetupDef::emInformationModel m_model = SystemSetupDef::emInformationModelDefault;
};
