#pragma once

// The side of a node that faces the source of the data.
class KSModelDataItem
{
public:
    virtual ~KSModelDataItem() = default;

    // The factory's handle of this node; never followed here. Null for the root and for inserted rows.
    virtual void* getSourceData() const = 0;
    virtual void setSourceData(void* data) = 0;
    // Whether the source was asked for the children.
    virtual bool isChildrenCreated() const = 0;
    virtual void setChildrenCreated(bool created) = 0;
};
