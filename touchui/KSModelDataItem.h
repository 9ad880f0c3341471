#pragma once

// The part of a node that refers to the source of the data.
class KSModelDataItem
{
public:
    virtual ~KSModelDataItem() = default;

    // The factory's handle of this node; never dereferenced here. Null for the root and for inserted rows.
    virtual void* getSourceData() const = 0;
    virtual void setSourceData(void* data) = 0;
    // Whether the children have been created from the source.
    virtual bool isChildrenCreated() const = 0;
    virtual void setChildrenCreated(bool created) = 0;
};
