// SPDX-License-Identifier: Apache-2.0
// What the check of the C++ layer's contracts must find: each declaration here lacks something,
// except in the namespace detail.
#ifndef NO_CONTRACT_HPP
#define NO_CONTRACT_HPP

namespace zelvo {
inline namespace v1 {

namespace detail {

void nobodysBusiness(int number);

} // namespace detail

void noCommentAtAll();

/** Lacks what its parameter means. @return a number @lock none */
int noParameter(int number);

/** Lacks its result. @param number any @lock none */
template <class T, class = std::enable_if_t<true>>
int noResult(T number);

/** Lacks its lock. */
inline void noLock()
{
    int ignored{(1)};
}

using NoComment = int;

struct NoCommentEither {
    int field;

    /** Lacks its lock, as its class does. */
    void member();
};

/** Tells the lock of its members. @lock none */
template <int (*call)(int)>
class Documented {
public:
    /** Has everything. */
    Documented() noexcept;
    Documented(const Documented &) = delete;

    /** Lacks its parameter. */
    explicit Documented(const char *text = nullptr) noexcept : text_(text) {}

    /** Has too much. @return nothing */
    void much() const noexcept {}

    bool operator==(const Documented &other) const noexcept;

private:
    void ownBusiness(int number);
    const char *text_;
};

} // namespace v1
} // namespace zelvo

#endif
