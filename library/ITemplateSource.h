#pragma once

#include <string>

// A set of templates for a tab of the template picker, which stores the last one selected.
class ITemplateSource
{
public:
    virtual ~ITemplateSource() = default;

    // Returns the path of the title file of the template selected last; empty when there is none or its file
    // does not exist.
    virtual std::string getLastSelectedTemplate() = 0;
    virtual void saveSelectedTemplate(std::string path) = 0;
};
