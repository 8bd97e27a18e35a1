// The word that closes a judgement.
#pragma once

#include <string_view>

namespace vantrel::sheets {

enum class Verdict { passed, failed, incomplete };

std::string_view name_of(Verdict verdict);

// Of several together: failed where one failed, or else incomplete where one is.
Verdict worse(Verdict first, Verdict second);

} // namespace vantrel::sheets
