#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <QString>

// The object name of a field, by which the field describes itself to the soft keyboard. A text of the canvas
// gives the whole record, eleven parts separated by "#" in the order of tagSoftKeyBoardInitData; other fields
// give "<keyboard type>#<title>#<selection mode>#<last value>", the last one or two of which may be missing.
namespace FieldName
{

QString write(const SubCommonDefine::tagSoftKeyBoardInitData& data);
// Reads either form into the record. Parts that are missing or not numbers leave what the record has; a name
// without a separator leaves all of it.
void read(const QString& name, SubCommonDefine::tagSoftKeyBoardInitData& data);
// Reads the short form only, whatever follows its four parts.
void readShort(const QString& name, SubCommonDefine::tagSoftKeyBoardInitData& data);

} // namespace FieldName
