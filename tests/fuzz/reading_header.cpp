// The header of a pushed message: a WSP Push, its content type and the security parameters of it.
#include "reading.h"

#include <algorithm>
#include <string_view>

namespace fuzz {

namespace {

constexpr struct {
    uint32_t code;
    std::string_view name;
} kContentTypes[] = {
    {54, "application/vnd.wap.connectivity-wbxml"}, {53, "application/vnd.wap.connectivity-xml"},
    {68, "application/vnd.syncml.notification"},    {78, "application/vnd.syncml.ds.notification"},
    {66, "application/vnd.syncml.dm+wbxml"},
};

constexpr std::size_t kLongestType = 63;
constexpr std::size_t kLongestMac = 43;

bool isLetters(std::string_view text, std::string_view letters)
{
    return std::equal(text.begin(), text.end(), letters.begin(), letters.end(), [](char a, char b) {
        return a == b || (a >= 'a' && a <= 'z' && a - 'a' + 'A' == b);
    });
}

// Takes the token or the name of a parameter, if the rest begins with one and a value follows.
bool takeParameter(std::string_view *rest, char token, std::string_view letters)
{
    if (rest->size() > 1 && rest->front() == token) {
        rest->remove_prefix(1);
        return true;
    }
    if (rest->size() > letters.size() + 1 && isLetters(rest->substr(0, letters.size()), letters)) {
        rest->remove_prefix(letters.size() + 1);
        return true;
    }
    return false;
}

} // namespace

HeaderReading readHeader(const uint8_t *data, std::size_t size)
{
    HeaderReading reading;
    if (size < 4 || data[1] != 0x06 || size - 3 < data[2]) {
        return reading;
    }
    reading.headerLength = data[2];
    std::string_view rest(reinterpret_cast<const char *>(data) + 3, size - 3);
    if (rest.front() == 0x1F) {
        rest.remove_prefix(std::min<std::size_t>(2, rest.size()));
    }
    if (rest.empty()) {
        return reading;
    }
    // A text is one of the names or nothing; its first letter may be a code all the same.
    const std::string_view text = rest.substr(0, rest.find('\0'));
    const bool isText =
        rest.front() >= 0x20 && text.size() < rest.size() && text.size() <= kLongestType;
    std::size_t taken = 1;
    for (const auto &type : kContentTypes) {
        if (isText && text == type.name) {
            reading.contentType = type.code;
            taken = text.size() + 1;
        }
    }
    for (const auto &type : kContentTypes) {
        if (reading.contentType == 0 && (rest.front() & 0x7F) == static_cast<int>(type.code)) {
            reading.contentType = type.code;
        }
    }
    if (reading.contentType == 0) {
        return reading;
    }
    rest.remove_prefix(taken);
    if (takeParameter(&rest, '\x91', "SEC")) {
        reading.security = static_cast<uint8_t>(rest.front());
        rest.remove_prefix(1);
    }
    if (takeParameter(&rest, '\x92', "MAC")) {
        const std::size_t length = rest.find('\0');
        if (length == rest.npos || length > kLongestMac) {
            return reading;
        }
        reading.mac = rest.substr(0, length);
    }
    reading.accepted = true;
    return reading;
}

} // namespace fuzz
