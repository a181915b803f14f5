/* SPDX-License-Identifier: Apache-2.0 */
/*
 * ZlvIntl.h - for authors of classes: what a class function may call. Class functions run with the
 * API mutex held, which is not recursive, so they call these and never a call that takes the mutex.
 * A twin does what the public call of its name does, without the mutex.
 */
#ifndef ZLV_INTL_H
#define ZLV_INTL_H

#include "ZlvIntlConfig.h"
#include "ZlvIntlLogging.h"
#include "ZlvIntlObject.h"
#include "ZlvIntlToolkit.h"
#include "ZlvListenerGroup.h"
#include "ZlvParmList.h"
#include "ZlvStringGroup.h"
#include "ZlvStringList.h"
#include "ZlvStringToObjCfgMap.h"
#include "ZlvStringToObjClassMap.h"
#include "ZlvStringToObjMap.h"
#include "ZlvStringToStringMap.h"
#include "ZlvToolkit.h"

#endif
