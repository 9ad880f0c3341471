#include "panel/TextToolsPanelController.h"

#include "document/SettingManager.h"
#include "support/LogManager.h"

#include <QFontDatabase>

QStringList TextToolsPanelController::getFontLib() const
{
    return QFontDatabase::families(QFontDatabase::Any);
}

FontStyle TextToolsPanelController::getLastTextStyle() const
{
    FontStyle style;
    if (SettingManager().loadLastTextParameter(&style) == 0)
        LOG_DEBUG_OPERATE(L"TextToolsPanelController", 200, L"read xml file failed");
    return style;
}

void TextToolsPanelController::setLastTextStyle(FontStyle style) const
{
    SettingManager().saveLastTextParameter(&style);
}
