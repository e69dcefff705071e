// An operator new of this program that grants so much and then refuses.
#pragma once

namespace GrantedMemory {

inline constexpr long unlimited = -1;
/// How often it grants before it refuses.
extern long granted;
/// Whether it refuses for good then, and not once only.
extern bool refusesForGood;
/// Whether it has refused.
extern bool refused;

} // namespace GrantedMemory
