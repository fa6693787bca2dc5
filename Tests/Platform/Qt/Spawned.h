// SPDX-License-Identifier: Apache-2.0
// Another process of a test: the program wire_peer in one of its roles.
#pragma once

#include <sys/types.h>

#include <cstdio>
#include <memory>
#include <string>
#include <vector>

namespace kelvasi::test {

// Killed, at the latest, when destroyed.
class Spawned {
 public:
  explicit Spawned(std::vector<std::string> arguments);
  ~Spawned();
  Spawned(const Spawned&) = delete;
  Spawned& operator=(const Spawned&) = delete;

  // The next line that it prints, waited for; "(end)" after the last.
  std::string line();
  void signal(int number) const;
  // Stops it, and returns when it stands.
  void stop() const;
  void resume() const;
  // Returns when it is dead.
  void kill();

 private:
  struct Closer {
    void operator()(std::FILE* file) const { std::fclose(file); }
  };

  pid_t process_ = -1;
  std::unique_ptr<std::FILE, Closer> output_;
};

}  // namespace kelvasi::test
