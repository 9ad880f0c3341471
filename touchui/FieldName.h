#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <QString>

// The object name of a field, which describes the field to the soft keyboard. A text of the canvas has the
// long form: the whole record, eleven parts separated by "#" in the order of tagSoftKeyBoardInitData. Other
// fields have the short form "<keyboard type>#<title>#<selection mode>#<last value>", whose last one or two
// parts may be missing.
namespace FieldName
{

QString write(const SubCommonDefine::tagSoftKeyBoardInitData& data);
// Reads either form into the record. Parts that are missing or not numeric leave the record unchanged, as
// does a name without a separator.
void read(const QString& name, SubCommonDefine::tagSoftKeyBoardInitData& data);
// Reads only the short form, ignoring further parts.
void readShort(const QString& name, SubCommonDefine::tagSoftKeyBoardInitData& data);

} // namespace FieldName
