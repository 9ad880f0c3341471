#pragma once

#include "messaging/ptc/WireRecord.h"

#include <QMetaType>

// Types of the system set-up service: languages and model of the appliance.
namespace SystemSetupDef
{

// Language of the whole appliance. All other values are languages that this program does not have; it uses
// English for them.
enum emSystemLanguageType : int {
    emSystemLanguageUnknown = 0,
    emSystemLanguageEnglish = 1,
    emSystemLanguageChinese = 2,
};

// Language of the soft keyboard. The names state the script that the font tables use for the number; all
// other values select the fonts for Latin only.
enum emInputLanguageType : int {
    emInputLanguageUnknown = 0,
    emInputLanguageJapanese = 7,
    emInputLanguageKorean = 8,
    emInputLanguageChineseSimplified = 9,
    emInputLanguageChineseMixed = 10,
};

// Model of the appliance. Model 1 is sold in China and has a single font family, FAMILY_FOR_CN_MODULE.
enum emInformationModel : int {
    emInformationModelDefault = 0,
    emInformationModelChina = 1,
};

// clang-format off

#define tagSystemLanguageParam_FIELDS(FIELD) \
    FIELD(Int, first, -1) \
    FIELD(Int, systemLanguage, 0) \
    FIELD(Int, inputLanguage, 0)

#define tagSystemInformation_FIELDS(FIELD) \
    FIELD(Int, model, 0)

// clang-format on
WIRE_RECORD(tagSystemLanguageParam);
WIRE_RECORD(tagSystemInformation);

} // namespace SystemSetupDef

Q_DECLARE_METATYPE(SystemSetupDef::emSystemLanguageType)
Q_DECLARE_METATYPE(SystemSetupDef::emInputLanguageType)
Q_DECLARE_METATYPE(SystemSetupDef::emInformationModel)
