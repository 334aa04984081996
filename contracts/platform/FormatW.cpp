#include <VizBridge/contracts/platform/FormatW.h>

#include <charconv>
#include <string_view>
#include <system_error>

namespace VizPort {

namespace {

/// Collects the result and refuses every character beyond the capacity, so that a long
/// argument is never formatted in full only to be cut afterwards.
class BoundedText {
public:
    explicit BoundedText(std::size_t capacity) : m_capacity(capacity) {}

    bool IsFull() const { return m_text.size() >= m_capacity; }

    void Put(char16_t c) {
        if (!IsFull())
            m_text.push_back(c);
    }
    void Put(char16_t const* text) {
        for (; *text != u'\0' && !IsFull(); ++text)
            m_text.push_back(*text);
    }
    void PutAscii(std::string_view digits) {
        for (char const c : digits)
            Put(static_cast<char16_t>(static_cast<unsigned char>(c)));
    }

    WString Take() { return std::move(m_text); }

private:
    std::size_t m_capacity;
    WString m_text;
};

// Room for the longest fixed-notation double: 309 integer digits, a sign, the point and six
// decimals.
constexpr std::size_t NumberBufferSize = 400;

// std::to_chars never looks at the locale, which keeps numbers in C notation.
template <typename... Options> void putNumber(BoundedText& out, Options... options) {
    char digits[NumberBufferSize];
    auto const [end, error] = std::to_chars(digits, digits + NumberBufferSize, options...);
    if (error == std::errc())
        out.PutAscii(std::string_view(digits, static_cast<std::size_t>(end - digits)));
}

/// Hands out the arguments in order; each conversion that takes one takes the next, whether
/// or not its kind fits, as a C formatter would.
class ArgumentCursor {
public:
    ArgumentCursor(FormatArg const* begin, FormatArg const* end) : m_next(begin), m_end(end) {}

    template <typename T> T const* Next() {
        if (m_next == m_end)
            return nullptr;
        return std::get_if<T>(m_next++);
    }

private:
    FormatArg const* m_next;
    FormatArg const* m_end;
};

} // namespace

WString FormatW(std::size_t bufferSize, char16_t const* format,
                std::initializer_list<FormatArg> args) {
    if (bufferSize == 0 || format == nullptr)
        return {};
    BoundedText out(bufferSize - 1);
    ArgumentCursor arguments(args.begin(), args.end());

    char16_t const* p = format;
    while (*p != u'\0' && !out.IsFull()) {
        if (*p != u'%') {
            out.Put(*p++);
            continue;
        }
        char16_t const conversion = p[1];
        if (conversion == u'%') {
            out.Put(u'%');
            p += 2;
        } else if (conversion == u's') {
            if (auto const* text = arguments.Next<char16_t const*>(); text && *text)
                out.Put(*text);
            p += 2;
        } else if (conversion == u'd') {
            if (auto const* value = arguments.Next<int>())
                putNumber(out, *value);
            p += 2;
        } else if (conversion == u'l' && p[2] == u'u') {
            if (auto const* value = arguments.Next<unsigned long>())
                putNumber(out, *value);
            p += 3;
        } else if (conversion == u'f') {
            if (auto const* value = arguments.Next<double>())
                putNumber(out, *value, std::chars_format::fixed, 6);
            p += 2;
        } else {
            // Not a conversion of ours: the percent sign stands as written, and what follows
            // it is copied as ordinary text by the next rounds.
            out.Put(u'%');
            ++p;
        }
    }
    return out.Take();
}

} // namespace VizPort
