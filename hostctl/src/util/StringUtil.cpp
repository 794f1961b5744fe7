#include "hostctl/util/StringUtil.h"

namespace PldCtl {
namespace Util {

void StringTokenize(const std::string& text, std::vector<std::string>& tokens, const std::string& delimiters) {
    std::string::size_type start = text.find_first_not_of(delimiters);
    while (start != std::string::npos) {
        const std::string::size_type end = text.find_first_of(delimiters, start);
        tokens.push_back(text.substr(start, end == std::string::npos ? std::string::npos : end - start));
        start = end == std::string::npos ? end : text.find_first_not_of(delimiters, end);
    }
}

}  // namespace Util
}  // namespace PldCtl
