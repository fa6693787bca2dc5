// SPDX-License-Identifier: Apache-2.0
// The standard input, output and error of a program whose standard output carries its result.
#pragma once

namespace kelvasi {

// To be called first. A standard stream that the program was started without is occupied, so that no file
// takes its number; using it fails. Writing into a pipe that nobody reads, or past the size that a file may
// have, fails too, instead of ending the process.
void secureStandardDescriptors();

}  // namespace kelvasi
