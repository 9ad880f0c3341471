#pragma once

#include "touchui/KSModelDataFactory.h"

#include <QString>

#include <memory>
#include <vector>

// The sample folders and files of the gallery's tree.
class SampleTree : public KSModelDataFactory
{
    Q_OBJECT
public:
    explicit SampleTree(QObject* parent = nullptr);
    ~SampleTree() override;

    void importSourceData() override {}
    void* getNextNode(void* node) override;
    void* getChildNode(void* node) override;
    void InstallItemAttribute(KSModelAttributeItem* item, void* node) override;

private:
    struct Node {
        QString name;
        Node* parent = nullptr;
        int number = 0; // index among its siblings
        std::vector<std::unique_ptr<Node>> children;
    };

    Node m_root;
};
