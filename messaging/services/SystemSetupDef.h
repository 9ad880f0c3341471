// Types of the system set-up service: languages and model of the appliance.
#pragma once

#include "messaging/ptc/WireRecord.h"

#include <QMetaType>

namespace SystemSetupDef
{

// Language of the whole appliance. Values beyond these belong to the appliance and mean English here.
enum emSystemLanguageType : int {
    emSystemLanguageUnknown = 0,
    emSystemLanguageEnglish = 1,
    emSystemLanguageChinese = 2,
};

// Language of the soft keyboard. The names tell the script that the font tables pair with the number;
// every other value selects the Latin-only row.
enum emInputLanguageType : int {
    emInputLanguageUnknown = 0,
    emInputLanguageJapanese = 7,
    emInputLanguageKorean = 8,
    emInputLanguageChineseSimplified = 9,
    emInputLanguageChineseMixed = 10,
};

// Model of the appliance; 1 is the model sold in China, whose only family is FAMILY_FOR_CN_MODULE.
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
