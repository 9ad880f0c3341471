// Reads the template folders with files of random bytes. The input is a sequence of files, each one byte that
// selects its name, two bytes of length and the bytes.
#include "FuzzFolder.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/TemplateManager.h"
#include "document/UserTemplateManager.h"

#include <algorithm>

namespace
{

const char* const FILES[] = {"/usertemplates/.order.xml",
                             "/usertemplates/UserTemplate_001/Titler.xml",
                             "/usertemplates/UserTemplate_002/Titler.xml",
                             "/usertemplates/UserTemplate_002/.order.xml",
                             "/templates/templates_en/.order.xml",
                             "/templates/templates_en/a.xml",
                             "/templates/templates_en/b.xml",
                             "/settings/TitlerLastPathSetting.xml"};

void writeFiles(const std::string& base, const std::uint8_t* data, std::size_t size)
{
    while (size >= 3) {
        const char* const name = FILES[data[0] % std::size(FILES)];
        const std::size_t length = std::min<std::size_t>(data[1] | (data[2] << 8), size - 3);
        FuzzFolder::write(base + name, FuzzFolder::view(data + 3, length));
        data += 3 + length;
        size -= 3 + length;
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const std::string base = FuzzFolder::instance().base();
    for (const char* folder : {"/usertemplates/UserTemplate_001", "/usertemplates/UserTemplate_002",
                               "/templates/templates_en", "/settings"})
        FuzzFolder::empty(base + folder);
    writeFiles(base, data, size);

    TemplateManager* const presets = TemplateManager::getInstance();
    for (const auto language : {TEMPLATE_LANGUAGE_EN, TEMPLATE_LANGUAGE_CHS}) {
        for (Archive* archive : presets->getTemplates(language))
            delete archive;
        presets->loadLastTemplatePath();
    }
    UserTemplateManager* const own = UserTemplateManager::getInstance();
    for (Archive* archive : own->getTemplates(TEMPLATE_LANGUAGE_EN))
        delete archive;
    own->loadLastTemplatePath();
    Archive archive;
    own->loadTemplate("UserTemplate_001", &archive);
    own->renameInOrderXml("UserTemplate_001", "UserTemplate_003");
    own->renameInOrderXml("UserTemplate_003", "UserTemplate_001");
    own->addNewTemplateToLastInOrderXml("UserTemplate_002");
    own->removeFromOrderXml("UserTemplate_002");
    ArchiveController().getFreeNameInUserTemplate(QString::fromStdString(base + "/usertemplates"));
    UserTemplateManager::cleanUp();
    TemplateManager::cleanUp();
    return 0;
}
