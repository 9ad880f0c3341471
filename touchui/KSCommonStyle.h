#pragma once

#include <QCommonStyle>

// Base class of the styles that paint from pictures: a plain style with the behaviour for operation with a
// finger.
class KSCommonStyle : public QCommonStyle
{
    Q_OBJECT
public:
    int styleHint(StyleHint hint, const QStyleOption* option = nullptr, const QWidget* widget = nullptr,
                  QStyleHintReturn* returnData = nullptr) const override;
};
