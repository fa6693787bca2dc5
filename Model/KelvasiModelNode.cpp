// SPDX-License-Identifier: Apache-2.0
#include "Model/KelvasiModelNode.h"

#include <algorithm>

#include "LogGenerator/ArrayLock.h"
#include "LogGenerator/SortPrefix.h"

namespace kelvasi {

namespace {

std::vector<const PlistDictionary::Entry*> entriesInOrder(const PlistDictionary& entries, bool isSorted) {
  std::vector<const PlistDictionary::Entry*> order;
  order.reserve(entries.size());
  for (const auto& entry : entries) order.push_back(&entry);
  if (isSorted)
    std::ranges::sort(order, {}, [](const auto* entry) -> const std::string& { return entry->first; });
  return order;
}

class TreeBuilder {
 public:
  explicit TreeBuilder(PathDictionary& nodesByPath) : nodesByPath_(nodesByPath) {}

  NodeRef build(std::string_view name, const PlistValue& object, const std::string& path) {
    const NodeRef node = make(name, object, path);
    nodesByPath_[path] = node;
    return node;
  }

 private:
  NodeRef make(std::string_view name, const PlistValue& object, const std::string& path) {
    if (const auto* text = object.string()) return leaf(name, *text);
    if (const auto* entries = object.dictionary()) return branch(name, childrenOf(*entries, path));
    if (const auto* elements = object.array()) return branch(name, childrenOf(*elements, path));
    return leaf(name, "(unknown)");
  }

  NodeList childrenOf(const PlistDictionary& entries, const std::string& path) {
    const bool isSorted = entries.find(sortedMark) != nullptr;
    NodeList children;
    children.reserve(entries.size());
    for (const auto* entry : entriesInOrder(entries, isSorted)) {
      const auto& [key, value] = *entry;
      if (key == sortedMark) continue;
      const std::string_view name = isSorted ? withoutSortPrefix(key) : key;
      children.push_back(build(name, value, pathByAppending(path, name)));
    }
    return children;
  }

  NodeList childrenOf(const PlistArray& elements, const std::string& path) {
    const ArrayGuard guard;
    NodeList children;
    children.reserve(elements.size());
    for (const PlistValue& element : elements) {
      const std::string name = std::to_string(children.size());
      children.push_back(build(name, element, pathByAppending(path, name)));
    }
    return children;
  }

  static NodeRef leaf(std::string_view name, std::string text) {
    return std::make_shared<KelvasiModelLeafNode>(std::string(name), std::move(text));
  }
  static NodeRef branch(std::string_view name, NodeList children) {
    return std::make_shared<KelvasiModelTreeNode>(std::string(name), std::move(children));
  }

  PathDictionary& nodesByPath_;
};

}  // namespace

NodeRef KelvasiModelNode::makeTreeFromObject(const PlistValue& display, PathDictionary& nodesByPath) {
  return TreeBuilder(nodesByPath).build("Kelvasi", display, "/");
}

std::string pathByAppending(std::string_view path, std::string_view name) {
  std::string joined;
  joined.reserve(path.size() + name.size() + 1);
  const auto append = [&](char character) {
    if (character != '/' || joined.empty() || joined.back() != '/') joined += character;
  };
  for (const char character : path) append(character);
  if (!name.empty() && !joined.empty()) append('/');
  for (const char character : name) append(character);
  if (joined.size() > 1 && joined.back() == '/') joined.pop_back();
  return joined;
}

}  // namespace kelvasi
