// SPDX-License-Identifier: Apache-2.0
/*
 * zelvo.hpp - the toolkit in C++17 and later: owning handles, logging calls whose arguments are
 * checked when they are compiled, classes of one's own as C++ classes, and a handler for the tests
 * of applications. It is a layer of headers over the C interface, which stays at hand: every handle
 * lends its record with get(). zelvo.h tells the conventions of both.
 *
 *  1. Life. A zelvo::Toolkit opens and closes the toolkit. Handles go before it does.
 *
 *  2. Failures. Nothing here throws of itself, and everything works with -fno-exceptions and
 *     -fno-rtti. A handle that could not get its object is empty, which an if () tells, and behaves
 *     as null does in C: getters give nothing, setters do nothing, logging calls are refused. What
 *     the standard library throws when memory runs out comes from the calls that return or keep its
 *     containers alone.
 *
 *  3. Threads. As in C, any thread may call at any time, except while the toolkit closes. One
 *     handle is used by one thread at a time, unless nobody changes it: logging does not.
 *
 *  4. Locks. The tag @lock of a class holds for each member that has none itself.
 *
 * The names are those of the inline namespace zelvo::v1, so that programs and libraries built with
 * different versions of these headers can be linked together.
 */
#ifndef ZELVO_HPP
#define ZELVO_HPP

#include "zelvo.h"
#include "zelvo_arguments.hpp"
#include "zelvo_class.hpp"
#include "zelvo_config.hpp"
#include "zelvo_entries.hpp"
#include "zelvo_event.hpp"
#include "zelvo_handle.hpp"
#include "zelvo_logger.hpp"
#include "zelvo_memory_handler.hpp"
#include "zelvo_object.hpp"
#include "zelvo_pattern.hpp"
#include "zelvo_text.hpp"

#endif
