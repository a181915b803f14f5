// SPDX-License-Identifier: Apache-2.0
// One valid argument for each type that a public call takes.
#pragma once

#include <cstdarg>
#include <type_traits>

#include "support/VaList.h"
#include "zelvo.h"

#if !defined(__clang__)
// An argument list has attributes that no template parameter carries, and none of them matters
// here.
#pragma GCC diagnostic ignored "-Wattributes"
#pragma GCC diagnostic ignored "-Wignored-attributes"
#endif

namespace zelvo_test {

/// What an argument list is as a parameter: a pointer on x86-64.
using VaListParameter = decltype([](va_list args) {
    return args;
}(*static_cast<va_list *>(nullptr)));

/// The class of the object that a call gets.
enum class Kind {
    Logger,
    Filter,
    Handler,
    Formatter,
    FileHandler,
    SharedFileHandler,
    MsgIdFilter,
    PDLogger,
    XmlFormatter,
    TraceFormatter
};

/// An open toolkit with one of everything.
class NullCallWorld {
public:
    explicit NullCallWorld(Kind kind);
    NullCallWorld(const NullCallWorld &) = delete;
    NullCallWorld &operator=(const NullCallWorld &) = delete;
    ~NullCallWorld();

    /// A valid argument of type T.
    template <class T>
    T sample()
    {
        using Bare = std::remove_cv_t<std::remove_pointer_t<T>>;
        if constexpr (std::is_pointer_v<T> && std::is_function_v<Bare>)
            return entry(T{});
        else if constexpr (std::is_pointer_v<T> && std::is_pointer_v<Bare>)
            return pointers(T{});
        else if constexpr (std::is_pointer_v<T>)
            return lent(static_cast<Bare *>(nullptr));
        else
            return value(T{});
    }

    VaListParameter args = nullptr;

private:
    template <class Result, class... Parameters>
    static auto entry(Result (*)(Parameters...))
    {
        return +[](Parameters...) -> Result { return Result(); };
    }

    char *const *pointers(char *const *) { return argv_; }
    CxMutex *pointers(CxMutex *) { return &mutex_; }
    CxDirectory *pointers(CxDirectory *) { return &directory_; }

    char *lent(char *) { return text_; }
    UChar *lent(UChar *) { return wide_; }
    void *lent(void *) { return bytes_; }
    ZlvBool *lent(ZlvBool *) { return &flag_; }
    int32_t *lent(int32_t *) { return &file_; }
    int64_t *lent(int64_t *) { return &process_; }
    uint32_t *lent(uint32_t *) { return &count_; }
    uint64_t *lent(uint64_t *) { return &thread_; }
    CxMutexRec *lent(CxMutexRec *) { return mutex_; }
    VaListParameter lent(VaListParameter) { return args; }
    CxStatus *lent(CxStatus *) { return &status_; }
    CxFilePath *lent(CxFilePath *) { return &path_; }
    CxFileInfo *lent(CxFileInfo *) { return &info_; }
    CxStringBuff *lent(CxStringBuff *) { return &buff_; }
    CxUStringBuff *lent(CxUStringBuff *) { return &wideBuff_; }
    CxPropList *lent(CxPropList *) { return &props_; }
    CxPropListIter *lent(CxPropListIter *) { return &propsAt_; }
    ZlvObject *lent(ZlvObject *) { return object_; }
    ZlvObjClass *lent(ZlvObjClass *) { return object_->objClass; }
    ZlvObjCfg *lent(ZlvObjCfg *) { return cfg_; }
    ZlvEvent *lent(ZlvEvent *) { return event_; }
    ZlvI18Msg *lent(ZlvI18Msg *) { return event_->message; }
    ZlvParm *lent(ZlvParm *) { return &parm_; }
    ZlvStrTokIter *lent(ZlvStrTokIter *) { return &tokens_; }
    StringList *lent(StringList *) { return strings_; }
    StringListNode *lent(StringListNode *) { return strings_->first; }
    ParmList *lent(ParmList *) { return parms_; }
    ParmListNode *lent(ParmListNode *) { return parms_->first; }
    StringGroup *lent(StringGroup *) { return names_; }
    StringGroupNode *lent(StringGroupNode *) { return names_->first; }
    ListenerGroup *lent(ListenerGroup *) { return listeners_; }
    ListenerGroupNode *lent(ListenerGroupNode *) { return listeners_->first; }
    StringToStringMap *lent(StringToStringMap *) { return texts_; }
    StringToStringMapNode *lent(StringToStringMapNode *) { return texts_->first; }
    StringToObjMap *lent(StringToObjMap *) { return objects_; }
    StringToObjMapNode *lent(StringToObjMapNode *) { return objects_->first; }
    StringToObjCfgMap *lent(StringToObjCfgMap *) { return cfgs_; }
    StringToObjCfgMapNode *lent(StringToObjCfgMapNode *) { return cfgs_->first; }
    StringToObjClassMap *lent(StringToObjClassMap *) { return classes_; }
    StringToObjClassMapNode *lent(StringToObjClassMapNode *) { return classes_->first; }

    ZlvStrTokIter value(ZlvStrTokIter) { return tokens_; }
    template <class Number>
    Number value(Number)
    {
        return Number{4};
    }

    char text_[512] = "sample";
    UChar wide_[512] = u"sample";
    alignas(16) char bytes_[512] = {};
    char *argv_[2] = {text_, nullptr};
    ZlvBool flag_ = 0;
    int32_t file_ = -1;
    int64_t process_ = 0;
    uint32_t count_ = 0;
    uint64_t thread_ = 0;
    CxMutex mutex_ = nullptr;
    CxDirectory opened_ = nullptr;
    CxDirectory directory_ = nullptr; ///< the same, until a call that fails forgets it
    CxStatus status_{CX_STATUS_OK, 0};
    CxFilePath path_{};
    CxFileInfo info_{};
    CxStringBuff buff_{};
    CxUStringBuff wideBuff_{};
    CxPropList props_{};
    CxPropListIter propsAt_{};
    ZlvParm parm_{};
    ZlvStrTokIter tokens_{};
    ZlvObject *object_ = nullptr;
    ZlvObjCfg *cfg_ = nullptr;
    ZlvEvent *event_ = nullptr;
    StringList *strings_ = nullptr;
    ParmList *parms_ = nullptr;
    StringGroup *names_ = nullptr;
    ListenerGroup *listeners_ = nullptr;
    StringToStringMap *texts_ = nullptr;
    StringToObjMap *objects_ = nullptr;
    StringToObjCfgMap *cfgs_ = nullptr;
    StringToObjClassMap *classes_ = nullptr;
};

/// Whether an iterator that is a record stands nowhere.
inline bool isEmpty(const CxPropListIter &at)
{
    return CxPropListIterHasNext(&at) == 0;
}
inline bool isEmpty(const ZlvStrTokIter &at)
{
    return ZlvStrTokIterHasNext(at) == 0;
}
/// Whether a parsed identifier names no format.
template <class Record>
bool isEmpty(const Record &record)
{
    return record.code == 0;
}

/// Lets go of a result that came with the ANSWER of a call.
void release(const volatile void *result, char answer);
template <class Result, class... Parameters>
void release(Result (*)(Parameters...), char)
{
}

} // namespace zelvo_test
