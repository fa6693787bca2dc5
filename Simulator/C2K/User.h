// SPDX-License-Identifier: Apache-2.0
// What the handset's user wants of it: calls and data sessions, with pauses between them.
#pragma once

#include "Simulator/Random.h"

namespace kelvasi::sim::c2k {

class User {
 public:
  enum class Wish { nothing, call, data };

  // Wants something once the handset has found its systems.
  explicit User(Random random) : random_(random), left_(random_.between(6, 9)) {}

  void pass(double seconds);
  // A call that was lost is not made again at once.
  void giveUp() { want(Wish::nothing); }
  Wish wish() const { return wish_; }

 private:
  void want(Wish wish);

  Random random_;
  Wish wish_ = Wish::nothing;
  double left_ = 0;  // seconds
};

}  // namespace kelvasi::sim::c2k
