// An operation with each of its platform calls failing in turn.
#pragma once

#include <gtest/gtest.h>

#include "platform/simulated/simulated.h"

// On a fresh machine each time: prepares, runs the operation with the n-th platform call failing, and looks at what is
// left; n = 1, 2, 3 ... until no call is left to fail, which is the last look. The returned number of faults tells that
// there were some.
template <typename Preparar, typename Operar, typename Conferir>
int ComCadaFalha(Preparar preparar, Operar operar, Conferir conferir) {
  for (int n = 1; n < 1000; ++n) {
    platform::simulated::Reset();
    preparar();
    platform::simulated::FailCall(n);
    operar();
    const bool falhou = platform::simulated::CallFailed();
    platform::simulated::FailCall(0);
    SCOPED_TRACE(testing::Message() << "platform call " << n << (falhou ? " failed" : " does not exist"));
    conferir();
    if (!falhou || testing::Test::HasFatalFailure()) return n - 1;
  }
  ADD_FAILURE() << "the faults never end";
  return 0;
}
