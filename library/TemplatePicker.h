#pragma once

#include "document/Archive.h"
#include "library/TemplateItem.h"
#include "library/TemplatePickerController.h"
#include "library/TemplateReloadRule.h"
#include "library/UserTemplatePickerController.h"
#include "messaging/services/MessageDefine.h"
#include "messaging/services/SystemSetupDef.h"
#include "touchui/DialogMasks.h"

#include <QDialog>
#include <QImage>
#include <QPixmap>
#include <QPoint>
#include <QPointer>
#include <QRect>
#include <QSize>
#include <QString>

class ArchiveItem;
class KSPushbutton;
class QLabel;
class QPushButton;
class TemplateTab;
class TitlerTabWidget;

// The dialog in which the operator picks the template for a new title: a tab with the presets of the system
// language, and a tab with the user templates, which shows file name and texts and has a Delete button. It
// exists as long as the main window and is shown with exec(); closing it keeps the selection. GUI thread.
class TemplatePicker : public QDialog
{
    Q_OBJECT

public:
    static const int SCREEN_WIDTH = 1371;
    static const int SCREEN_HEIGHT = 833;
    static const QSize SCREEN_SIZE;
    static const int TAB_AREA_WIDTH = 1329;
    static const int TAB_AREA_HIGHT = 669;
    static const QSize TAB_AREA_SIZE;
    static const int SCROLL_AREA_WIDTH = 1049;
    static const int SCROLL_AREA_HIGHT = 595;
    static const QSize SCROLL_AREA_SIZE;
    static const int TABS_HIGHT = 52;
    static const int PAINS_SPACE = 8;
    static const int PARTS_SPACE = 6;
    static const int PAIN_LINE = 2;
    static const int OUTER_MARGIN_WIDTH = 10;
    static const int OUTER_MARGIN_HIGHT = 9;
    static const int PROPERTY_AREA_PARTS_WIDTH = 250;
    static const int TAB_AREA_OUTTER_MARGIN_WIDTH = 11;
    static const int GRID_SPACING = 10;
    static const int MAX_COLUMN = 4;
    static const QRect LINE_RECT;
    static const QRect BTMLINE_RECT;
    static const QPoint OUTSIDE_BORDER_STARTPOINT;
    static const QPoint INSIDE_BORDER_STARTPOINT;
    static const QSize TOOLBARBTN_SIZE;

    explicit TemplatePicker(QWidget* parent = nullptr);
    ~TemplatePicker() override;

    // Has the presets read again if the language requires it. They are read when they are needed, which is
    // when the dialog is shown.
    void reloadTemplates(SystemSetupDef::emSystemLanguageType language);
    // Reads the user templates again.
    void reloadTemplates2();
    // Switches to the user templates and shows the last of them.
    void showUserTemplateTab();
    // Takes ownership of the record.
    TemplateItem* addNewTemplateToLast(Archive* archive);

    // Returns whether a template was picked since setSelectedItem(false).
    bool isSelectedItem() const { return m_selectedItem; }
    void setSelectedItem(bool selected) { m_selectedItem = selected; }

    void setModuleInfo(SystemSetupDef::emInformationModel module) { m_module = module; }
    void setSystemLanFont(QFont font);
    void translateText();

    void showDialogMaskWidget(bool show) { m_masks.showDialogMaskWidget(show); }
    void showMessageMaskWidget(bool show) { m_masks.showMessageMaskWidget(show); }

    // Reads the presets if necessary.
    TemplateTab* presetTab();
    TemplateTab* userTab() const { return m_userTab; }

Q_SIGNALS:
    // Emitted when a template was picked. The picker owns the record, which is valid during the call.
    void selectedTemplate(Archive* archive);
    // Emitted before a question is shown, so that the soft keyboard is closed.
    void signalCloseSoftwareKeyBoardForFileManager();

public Q_SLOTS:
    // Called when a template folder was saved by the list or changed by the file manager. Names are those of
    // folders. A path is that of a folder or of any file in it; an import may pass a path as its name. A
    // rename or delete of a folder that is not a template is logged and ignored.
    void slotSaveAsTemplate(QString name);
    void slotImportNewUserTemplate(QString name);
    void slotRenameUserTemplate(QString oldName, QString newName, QString path);
    void slotDeleteUserTemplate(QString path);

    void cancelClicked();
    void selectClicked();
    void selectClicked2();
    void deleteClicked2();
    void buttonPressed(KSPushbutton* button);
    void buttonReleased(KSPushbutton* button);
    void itemSelected(QPushButton* button);
    void triggerSelected(int index, TemplateItem* item);
    void slotDeleteCloseMessage(MessageDefine::tagCloseParam param);

protected:
    void paintEvent(QPaintEvent* event) override;
    void showEvent(QShowEvent* event) override;

private:
    void createTabs();
    void createPropertyArea();
    void createButtons();
    KSPushbutton* createButton(QWidget* parent, const QPoint& position, const char* name);
    QLabel* createLabel(QWidget* parent, const QRect& area, const char* name);
    void initImageView();
    void initImageView2();
    void take(TemplateTab& tab);
    int deleteUserTemplate();
    void overrideTemplate(int id);
    int findTemplateIdFromName(const QString& name) const;
    void updateButtons();
    void updateUserTemplateArea();
    void updateTextObjectArea(const Archive& archive);
    void updateFilenameArea(const QString& name);
    void drawHorizontalLine(QPainter& painter);

    TemplatePickerController m_controller;
    UserTemplatePickerController m_userController;
    TemplateReloadRule m_reloadRule;
    bool m_arePresetsRead = false;
    bool m_pin = false; // use the Chinese presets for every language
    SystemSetupDef::emInformationModel m_module = SystemSetupDef::emInformationModelDefault;
    bool m_selectedItem = false;
    // The template of the question being shown. The answer is ignored when another one is selected by then.
    QPointer<TemplateItem> m_askedItem;

    TitlerTabWidget* m_tabs = nullptr;
    TemplateTab* m_presetTab = nullptr;
    TemplateTab* m_userTab = nullptr;
    QLabel* m_title = nullptr;
    QLabel* m_fileNameCaption = nullptr;
    QLabel* m_fileName = nullptr;
    QLabel* m_textCaption = nullptr;
    ArchiveItem* m_preview = nullptr;
    Archive m_previewArchive;
    KSPushbutton* m_selectButton = nullptr;
    KSPushbutton* m_selectButton2 = nullptr;
    KSPushbutton* m_deleteButton2 = nullptr;
    KSPushbutton* m_cancelButton = nullptr;
    QPixmap m_frame;
    QImage m_separator;
    DialogMasks m_masks;
};
