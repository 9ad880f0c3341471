// A set of templates from which new titles start, and the one that was taken last. Strings are UTF-8. GUI
// thread.
#pragma once

#include <string>
#include <vector>

class Archive;

// Of the preset designs. Any value other than that for English stands for Chinese.
enum emTemplateLanguage { TEMPLATE_LANGUAGE_EN = 0, TEMPLATE_LANGUAGE_CHS = 1 };

class ITemplateManager
{
public:
    // The templates in the order of their order file; those that cannot be read are left out. The caller owns
    // them.
    virtual std::vector<Archive*> getTemplates(emTemplateLanguage language) = 0;

    // Path of the title file of the template that was taken last; empty when there is none.
    virtual std::string loadLastTemplatePath() = 0;

    // 1 when it was saved; 0 otherwise, as where the set is read-only.
    virtual int saveLastTemplatePath(std::string path) = 0;

    virtual ~ITemplateManager() = default;
};
