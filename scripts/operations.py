# SPDX-License-Identifier: Apache-2.0
"""The operations that several kinds of containers share, for their generators."""

from containers import UNLOCKED, Operation


def common_operations(word):
    """What every kind offers alike."""
    iterator = ("${Type}Iterator iterator", "where the walk stands")
    return [
        Operation(
            "Alloc$Type", "$Type *", [],
            "Makes an empty $word.",
            "the $word, which the caller frees with ZlvFree$Type(); null when memory ran out",
            "zelvo::allocRecord<$Type>()"),
        Operation(
            "Free$Type", "void", [(f"$Type *{word}", "null is ignored")],
            "Removes what the $word holds, oldest first, and frees the $word.",
            "", f"Impl::free({word})"),
        Operation(
            "${Type}Iterator", "${Type}Iterator",
            [(f"const $Type *{word}", "null is walked like an empty $word")],
            "Starts a walk at the oldest node. There is nothing to free after it.",
            "the oldest node, owned by the $word; null when there is none",
            f"zelvo::firstNode({word})"),
        Operation(
            "${Type}IterHasNext", "ZlvBool", [iterator],
            "Tells whether the walk stands on a node.",
            "1 when it does, 0 at the end of the $word and for null",
            "iterator != nullptr"),
        Operation(
            "${Type}IterNext", "${Type}Iterator", [iterator],
            "Moves on by one node.",
            "the following node, owned by the $word; null at the end and for null",
            "zelvo::nextNode(iterator)"),
    ]


def element_operations(word):
    """What lists and groups offer alike."""
    iterator = ("${Type}Iterator iterator", "where the walk stands")
    return [
        Operation(
            "${Type}IterGet", "$element", [iterator],
            "Hands out the element that the walk stands on.",
            "$handed; null for a null iterator",
            "Impl::iterGet(iterator)"),
        Operation(
            "${Type}IterRem", "${Type}Iterator", [iterator],
            "Removes the node that the walk stands on and lets its element go. The caller goes on "
            "from the result and does not call Zlv${Type}IterNext() first.",
            "the node that followed, owned by the $word; null at the end and for null",
            "Impl::iterRemove(iterator)"),
        Operation(
            "${Type}GetLink", "${Type}Node *",
            [(f"const $Type *{word}", "null gives null"),
             ("$given element", "what to look for; null gives null")],
            "Finds the oldest node that holds an element equal to the one given: $equal. Takes no "
            "lock, so a caller that shares the $word holds the API mutex.",
            "the node, owned by the $word; null when there is none",
            f"Impl::getLink({word}, element)", UNLOCKED),
    ]
