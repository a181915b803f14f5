// SPDX-License-Identifier: Apache-2.0
// The toolkit's process-wide state: the API mutex and the registries. All of it is read and written
// with the API mutex held, except for the lazy creation of the mutex itself.
#pragma once

#include "CxMutex.h"
#include "ZlvIntl.h"
#include "ZlvStringGroup.h"
#include "ZlvStringToObjCfgMap.h"
#include "ZlvStringToObjClassMap.h"
#include "ZlvStringToObjMap.h"

CX_BEGIN_DECLS

extern ZLV_API CxMutex ZLV_TK_API_MUTEX;
extern ZLV_API ZlvBool ZLV_TK_API_MUTEX_EXISTS; ///< 1 while ZLV_TK_API_MUTEX is created

extern ZLV_API StringToObjClassMap *ZLV_TK_CLASSES; ///< null until the first registration
extern ZLV_API StringGroup *ZLV_TK_LOGGER_CLASSNAMES;
extern ZLV_API StringGroup *ZLV_TK_FILTER_CLASSNAMES;
extern ZLV_API StringGroup *ZLV_TK_HANDLER_CLASSNAMES;
extern ZLV_API StringGroup *ZLV_TK_FORMATTER_CLASSNAMES;

extern ZLV_API StringToObjMap *ZLV_TK_INSTANCES; ///< null until the first object
extern ZLV_API ZlvBool ZLV_TK_ISOPEN;
extern ZLV_API ZlvObject *ZLV_TK_ERROR_LOG; ///< meaningful only while ZLV_TK_ISOPEN is 1

extern ZLV_API StringGroup *ZLV_TK_CFG_NAMES; ///< in order of registration
extern ZLV_API StringToObjCfgMap *ZLV_TK_CFG_DATA;
extern ZLV_API ZlvBool ZLV_TK_LOG_MGR_INITIALIZED; ///< 1 while both containers exist

CX_END_DECLS

namespace zelvo {

/// True from the moment close begins to free objects until it has ended: nothing is created then.
bool isClosing();

} // namespace zelvo
