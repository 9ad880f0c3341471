#pragma once

#include "touchui/KSModelAttributeItem.h"
#include "touchui/KSModelDataFactory.h"
#include "touchui/KSVIEW.h"

#include <QDateTime>
#include <QIcon>
#include <QList>
#include <QString>
#include <memory>

struct SourceNode {
    QString name;
    QDateTime date;
    qint64 size = 0;
    bool folder = false;
    SourceNode* parent = nullptr;
    QList<SourceNode*> children;
};

// A source of folders and files for the tree that counts the requests.
class TreeSource : public KSModelDataFactory
{
public:
    TreeSource()
    {
        setColumnDataType(0, NameDataType);
        setColumnDataType(1, DateDataType);
        setColumnDataType(2, SizeDataType);
    }
    ~TreeSource() override { qDeleteAll(m_nodes); }

    SourceNode* add(const QString& name, SourceNode* parent, bool folder, int day = 1, qint64 size = 0)
    {
        auto* node =
            new SourceNode{name, QDateTime(QDate(2024, 1, day), QTime(12, 0)), size, folder, parent, {}};
        m_nodes.append(node);
        (parent != nullptr ? parent->children : m_top).append(node);
        return node;
    }

    void fill(int folders, int files)
    {
        for (int i = 0; i < folders; ++i) {
            SourceNode* folder =
                add(QStringLiteral("Folder %1").arg(i, 3, 10, QLatin1Char('0')), nullptr, true);
            for (int j = 0; j < files; ++j)
                add(QStringLiteral("Title %1").arg(j), folder, false);
        }
    }

    void importSourceData() override { ++imports; }

    void* getNextNode(void* node) override
    {
        ++walked;
        const auto* here = static_cast<SourceNode*>(node);
        const QList<SourceNode*>& siblings = here->parent != nullptr ? here->parent->children : m_top;
        return siblings.value(siblings.indexOf(here) + 1);
    }

    void* getChildNode(void* node) override
    {
        return (node != nullptr ? static_cast<SourceNode*>(node)->children : m_top).value(0);
    }

    void InstallItemAttribute(KSModelAttributeItem* item, void* node) override
    {
        ++installed;
        const auto* here = static_cast<SourceNode*>(node);
        item->setAttributeMaxKey(Qt::DisplayRole, 2);
        item->setAttribute(Qt::DisplayRole, here->name, 0);
        item->setAttribute(Qt::DisplayRole, here->date.toString(QStringLiteral("yyyy-MM-dd")), 1);
        item->setAttribute(Qt::DisplayRole, here->size, 2);
        item->setAttributeMaxKey(Qt::EditRole, 2);
        item->setAttribute(KSVIEW::ItemIsForderRole, here->folder, 0);
        item->setAttribute(KSVIEW::ItemDateRole, here->date, 0);
        item->setAttribute(KSVIEW::ItemSizeRole, here->size, 0);
        item->setAttribute(KSVIEW::ItemCheckableRole, checkable, 0);
        item->setAttributeMaxKey(KSVIEW::ItemEditableRole, 1);
        item->setAttribute(KSVIEW::ItemEditableRole, here->folder, 0);
        if (here->folder) {
            item->setAttributeMaxKey(Qt::DecorationRole, 1);
            item->setAttribute(Qt::DecorationRole, QIcon(QStringLiteral(":/FolderPicker/Picker_Icon_Enabel")),
                               0);
        }
    }

    bool checkable = false;
    int imports = 0;
    int installed = 0;
    int walked = 0;

private:
    QList<SourceNode*> m_top;
    QList<SourceNode*> m_nodes;
};
