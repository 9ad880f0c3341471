#pragma once

#include <string>
#include <vector>

class Archive;

// Language of the preset designs. All values other than TEMPLATE_LANGUAGE_EN select Chinese.
enum emTemplateLanguage { TEMPLATE_LANGUAGE_EN = 0, TEMPLATE_LANGUAGE_CHS = 1 };

// A set of templates from which new titles are made, and the template that was used last. Strings are UTF-8.
// GUI thread.
class ITemplateManager
{
public:
    // Returns the templates in the order of their order file, without those that cannot be read. The caller
    // owns them.
    virtual std::vector<Archive*> getTemplates(emTemplateLanguage language) = 0;

    // Returns the path of the title file of the template that was used last; empty if there is none.
    virtual std::string loadLastTemplatePath() = 0;

    // Returns 1 if the path was saved; 0 otherwise, for example if the set is read-only.
    virtual int saveLastTemplatePath(std::string path) = 0;

    virtual ~ITemplateManager() = default;
};
