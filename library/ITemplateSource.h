// What a tab of the template picker is fed from: a set of templates that remembers which was taken last.
#pragma once

#include <string>

class ITemplateSource
{
public:
    virtual ~ITemplateSource() = default;

    // Path of the title file of the template that was taken last; empty when there is none, and when that
    // file is gone.
    virtual std::string getLastSelectedTemplate() = 0;
    virtual void saveSelectedTemplate(std::string path) = 0;
};
