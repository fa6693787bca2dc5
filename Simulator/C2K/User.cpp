// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/User.h"

namespace kelvasi::sim::c2k {

namespace {

struct Span {
  double shortest;  // seconds
  double longest;
};
// In the order of the wishes.
constexpr Span spans[]{{8, 20}, {20, 60}, {20, 45}};
// Of the data sessions, how many a call puts an end to.
constexpr double shareOfInterrupted = 0.2;

}  // namespace

void User::want(Wish wish) {
  wish_ = wish;
  const Span& span = spans[static_cast<std::size_t>(wish)];
  left_ = random_.between(span.shortest, span.longest);
}

void User::pass(double seconds) {
  left_ -= seconds;
  if (left_ > 0) return;
  if (wish_ == Wish::nothing) return want(random_.happens(0.5) ? Wish::call : Wish::data);
  want(wish_ == Wish::data && random_.happens(shareOfInterrupted) ? Wish::call : Wish::nothing);
}

}  // namespace kelvasi::sim::c2k
