// SPDX-License-Identifier: Apache-2.0
// Everything that a call can answer, as text that can be compared and read.
#pragma once

#include <string>
#include <type_traits>

#include "zelvo.h"

namespace zelvo_test {

std::string textOf(const char *text);
std::string textOf(const UChar *text);
std::string textOf(CxStatus status);
std::string textOf(ZlvStatus status);
std::string textOf(const ZlvObject *object); ///< name and class
std::string textOf(const ZlvObjCfg *cfg);    ///< name
std::string textOf(const ZlvObjClass *objClass);
std::string textOf(const ZlvEvent *event);
std::string textOf(const ZlvI18Msg *message);
std::string textOf(const ZlvParm *parm);
std::string textOf(const CxStringBuff &buff);
std::string textOf(const CxUStringBuff &buff);
std::string textOf(const FileHandlerVars &vars);

inline std::string textOf(const void *block)
{
    return block != nullptr ? "block" : "null";
}

template <class Number>
requires std::is_arithmetic_v<Number> std::string textOf(Number number)
{
    return std::to_string(number);
}

/// What stands at a place in a list or group.
template <class Node>
requires requires(const Node *node)
{
    node->element;
}
std::string textOf(const Node *node)
{
    return node != nullptr ? textOf(node->element) : "null";
}

/// What stands at a place in a map.
template <class Node>
requires requires(const Node *node)
{
    node->key;
}
std::string textOf(const Node *node)
{
    return node != nullptr ? textOf(node->key) + "=" + textOf(node->value) : "null";
}

/// A container: "null", or its elements in their order.
template <class Container>
requires requires(const Container *container)
{
    container->first;
}
std::string textOf(const Container *container)
{
    if (container == nullptr)
        return "null";
    std::string text = "(";
    for (auto *node = container->first; node != nullptr; node = node->next)
        text += textOf(node) + (node->next != nullptr ? ", " : "");
    return text + ")";
}

} // namespace zelvo_test
