#include "gallery/SampleTree.h"

#include "touchui/KSModelAttributeItem.h"
#include "touchui/KSVIEW.h"

#include <QIcon>

namespace
{

constexpr int FOLDERS = 12;
constexpr int FILES = 8;

} // namespace

SampleTree::SampleTree(QObject* parent) : KSModelDataFactory(parent)
{
    setColumnDataType(0, NameDataType);
    const auto add = [](Node& parentNode, const QString& name) -> Node& {
        auto node = std::make_unique<Node>();
        node->name = name;
        node->parent = &parentNode;
        node->number = static_cast<int>(parentNode.children.size());
        parentNode.children.push_back(std::move(node));
        return *parentNode.children.back();
    };
    for (int i = 1; i <= FOLDERS; ++i) {
        Node& folder =
            add(m_root, i == 3 ? QStringLiteral("A folder with a name that is too long for its cell")
                               : QStringLiteral("Folder %1").arg(i));
        for (int j = 1; j <= FILES; ++j)
            add(folder, QStringLiteral("Title %1").arg(j));
    }
}

SampleTree::~SampleTree() = default;

void* SampleTree::getNextNode(void* node)
{
    const auto* here = static_cast<Node*>(node);
    const std::size_t next = static_cast<std::size_t>(here->number) + 1;
    return next < here->parent->children.size() ? here->parent->children[next].get() : nullptr;
}

void* SampleTree::getChildNode(void* node)
{
    const Node* here = node != nullptr ? static_cast<Node*>(node) : &m_root;
    return here->children.empty() ? nullptr : here->children.front().get();
}

void SampleTree::InstallItemAttribute(KSModelAttributeItem* item, void* node)
{
    const auto* here = static_cast<Node*>(node);
    const bool folder = here->parent == &m_root;
    item->setAttributeMaxKey(Qt::DisplayRole, 1);
    item->setAttribute(Qt::DisplayRole, here->name, 0);
    item->setAttribute(Qt::DisplayRole, QStringLiteral("2024-05-%1").arg(here->number + 10), 1);
    item->setAttribute(KSVIEW::ItemIsForderRole, folder, 0);
    item->setAttribute(KSVIEW::ItemCheckableRole, true, 0);
    item->setAttribute(KSVIEW::ItemEnableRole, here->number != 4, 0);
    if (folder) {
        item->setAttributeMaxKey(Qt::DecorationRole, 1);
        item->setAttribute(Qt::DecorationRole, QIcon(QStringLiteral(":/FolderPicker/Titler_folder_icon")), 0);
    }
    if (folder && here->number == 5)
        item->setAttribute(KSVIEW::ItemLoadingRole, 3, 0);
    if (folder && here->number == 6)
        item->setAttribute(KSVIEW::ItemRecordingRole, true, 0);
}
