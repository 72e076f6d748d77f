//===- BaselineAnswer.h - How the baseline provider gets its answer -*- C++ -*-===//
//
/// \file
/// The baseline provider is a shared object loaded by the object manager, as
/// every provider is; the benchmark hands it the answer to build through
/// this one exported function, found with ObjectManager::providerSymbol.
//
//===----------------------------------------------------------------------===//

#ifndef TVR_BENCHMARKS_BASELINEANSWER_H
#define TVR_BENCHMARKS_BASELINEANSWER_H

#include "tvr/broker/Value.h"

#include <vector>

namespace tvr::bench {

/// Makes the provider answer with \p instances (which must outlive its use).
using SetBaselineAnswer = void (*)(const std::vector<broker::Instance> *instances);

/// The name under which the baseline provider exports its SetBaselineAnswer.
constexpr const char *kSetBaselineAnswerSymbol = "tvrBenchSetBaselineAnswer";

} // namespace tvr::bench

#endif // TVR_BENCHMARKS_BASELINEANSWER_H
