#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace orvela {

/// What somebody may have meant who wrote a name that there is not.
namespace NearestNames {

/// `name` in lower case without anything but letters and digits.
std::string plain(std::string_view name);

/// Up to three of `names` that are as near to `wanted` as any: they become it by few changes of a letter, or
/// hold it. Case and punctuation do not count.
std::vector<std::string> of(std::string_view wanted, const std::vector<std::string>& names);

/// "; did you mean A or B? LIST", or "; LIST" when no name is near.
/// @param list  where all names stand
std::string advice(std::string_view wanted, const std::vector<std::string>& names, const std::string& list);

} // namespace NearestNames

} // namespace orvela
