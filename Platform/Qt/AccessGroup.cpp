// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/AccessGroup.h"

#include <grp.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <charconv>
#include <cstdlib>
#include <string_view>
#include <vector>

namespace kelvasi {

namespace {

std::optional<gid_t> numbered(std::string_view text) {
  gid_t id = 0;
  const auto [end, error] = std::from_chars(text.begin(), text.end(), id);
  if (error != std::errc() || end != text.end()) return std::nullopt;
  return id;
}

std::optional<gid_t> named(const char* name) {
  std::vector<char> texts(1024);
  group entry{};
  group* found = nullptr;
  int error = 0;
  while ((error = ::getgrnam_r(name, &entry, texts.data(), texts.size(), &found)) == ERANGE)
    texts.resize(2 * texts.size());
  if (error != 0 || !found) return std::nullopt;
  return found->gr_gid;
}

bool isOurs(gid_t group) {
  if (group == ::getegid()) return true;
  std::vector<gid_t> groups(static_cast<std::size_t>(std::max(0, ::getgroups(0, nullptr))));
  const int count = ::getgroups(static_cast<int>(groups.size()), groups.data());
  return count > 0 && std::ranges::find(groups, group) != groups.end();
}

std::vector<gid_t> supplementaryGroups(int socket) {
  std::vector<gid_t> groups;
  socklen_t size = 0;
  // Of too small a place the system says how large it has to be.
  if (::getsockopt(socket, SOL_SOCKET, SO_PEERGROUPS, nullptr, &size) == 0 || errno != ERANGE) return groups;
  groups.resize(size / sizeof(gid_t));
  if (::getsockopt(socket, SOL_SOCKET, SO_PEERGROUPS, groups.data(), &size) != 0) groups.clear();
  return groups;
}

}  // namespace

AccessGroup AccessGroup::ofEnvironment() {
  const char* text = std::getenv("TELVON_GROUP");
  if (!text || !*text) return {};
  std::optional<gid_t> id = numbered(text);
  if (!id) id = named(text);
  if (!id) return {.id = {}, .fault = "TELVON_GROUP names no group: " + std::string(text)};
  if (!isOurs(*id)) return {.id = id, .fault = "this process is not in the group of TELVON_GROUP"};
  return {.id = id, .fault = {}};
}

bool isPeerInGroup(int socket, gid_t group) {
  ucred peer{};
  socklen_t size = sizeof peer;
  if (::getsockopt(socket, SOL_SOCKET, SO_PEERCRED, &peer, &size) == 0 && peer.gid == group) return true;
  const std::vector<gid_t> groups = supplementaryGroups(socket);
  return std::ranges::find(groups, group) != groups.end();
}

}  // namespace kelvasi
