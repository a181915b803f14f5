// SPDX-License-Identifier: Apache-2.0
#include "ZlvDeferredFree.h"

#include <type_traits>

#include "CxMemory.h"
#include "ZlvObject.h"

namespace zelvo {
namespace {

/// A list of dead records, each pointing at the next through its member LINK.
template <class T, auto LINK>
class DeadList {
public:
    void push(T *record)
    {
        using Link = std::remove_reference_t<decltype(record->*LINK)>;
        record->*LINK = reinterpret_cast<Link>(head_);
        head_ = record;
    }

    void freeAll()
    {
        while (head_ != nullptr) {
            T *record = head_;
            head_ = reinterpret_cast<T *>(record->*LINK);
            RkoMemoryFree(record);
        }
    }

private:
    T *head_ = nullptr;
};

// What a walk may still read is not used as a link: next, prev, and the value of a map node.
constinit DeadList<ZlvObject, &ZlvObject::vars> deadObjects;
constinit DeadList<ListenerGroup, &ListenerGroup::last> deadGroups;
constinit DeadList<ListenerGroupNode, &ListenerGroupNode::owner> deadListenerNodes;
constinit DeadList<StringToObjMapNode, &StringToObjMapNode::map> deadObjectNodes;
constinit DeadList<StringToObjCfgMapNode, &StringToObjCfgMapNode::map> deadCfgNodes;

} // namespace

void defer(ZlvObject *object)
{
    deadObjects.push(object);
}

void defer(ListenerGroup *group)
{
    deadGroups.push(group);
}

void defer(ListenerGroupNode *node)
{
    deadListenerNodes.push(node);
}

void defer(StringToObjMapNode *node)
{
    deadObjectNodes.push(node);
}

void defer(StringToObjCfgMapNode *node)
{
    deadCfgNodes.push(node);
}

void freeDeferred()
{
    deadObjects.freeAll();
    deadGroups.freeAll();
    deadListenerNodes.freeAll();
    deadObjectNodes.freeAll();
    deadCfgNodes.freeAll();
}

} // namespace zelvo
