#include "judge/verdict.h"

namespace vantrel::sheets {

std::string_view name_of(Verdict verdict)
{
    switch (verdict) {
    case Verdict::passed:
        return "passed";
    case Verdict::failed:
        return "failed";
    case Verdict::incomplete:
        break;
    }
    return "incomplete";
}

Verdict worse(Verdict first, Verdict second)
{
    for (const Verdict verdict : {Verdict::failed, Verdict::incomplete})
        if (first == verdict || second == verdict)
            return verdict;
    return Verdict::passed;
}

} // namespace vantrel::sheets
