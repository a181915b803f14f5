// SPDX-License-Identifier: Apache-2.0
#include "ZlvDeferredFree.h"

#include <functional>
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
        auto &link = std::invoke(LINK, *record);
        link = reinterpret_cast<std::remove_reference_t<decltype(link)>>(head_);
        head_ = record;
    }

    void freeAll()
    {
        while (head_ != nullptr) {
            T *record = head_;
            head_ = reinterpret_cast<T *>(std::invoke(LINK, *record));
            RkoMemoryFree(record);
        }
    }

private:
    T *head_ = nullptr;
};

/// What an object has for its kind alone is not looked at once it has no class.
void *&wordOfItsKind(ZlvObject &object)
{
    return object.handler.reserved;
}

// What somebody may still read is not used as a link: next, prev and the value of a map node in a
// walk, and the variables of an object that foreign code has destroyed in the middle of its entry.
constinit DeadList<ZlvObject, wordOfItsKind> deadObjects;
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
