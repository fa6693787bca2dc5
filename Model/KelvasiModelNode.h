// SPDX-License-Identifier: Apache-2.0
// The display tree: immutable named nodes, each a leaf with a text or a branch with ordered children. A
// branch is told from a leaf by whether childNodes() is null, never by its count.
#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

#include "Plist/PlistValue.h"

namespace kelvasi {

class KelvasiModelNode;
using NodeRef = std::shared_ptr<const KelvasiModelNode>;
using NodeList = std::vector<NodeRef>;
// From a node's path to the node: "/" for the root, "/Serving Cell" for a child of it.
using PathDictionary = std::unordered_map<std::string, NodeRef>;

class KelvasiModelNode {
 public:
  virtual ~KelvasiModelNode() = default;

  const std::string& displayName() const { return name_; }
  // Null for a leaf.
  virtual const NodeList* childNodes() const { return nullptr; }
  // Null for a branch.
  virtual const std::string* value() const { return nullptr; }

  // The tree of a display, its root named "Kelvasi"; every node is entered into `nodesByPath` under its path.
  // Of two nodes with one path the one built later is found, children being built before their parent.
  static NodeRef makeTreeFromObject(const PlistValue& display, PathDictionary& nodesByPath);

 protected:
  explicit KelvasiModelNode(std::string name) : name_(std::move(name)) {}

 private:
  std::string name_;
};

class KelvasiModelLeafNode : public KelvasiModelNode {
 public:
  KelvasiModelLeafNode(std::string name, std::string value)
      : KelvasiModelNode(std::move(name)), string_(std::move(value)) {}
  const std::string* value() const override { return &string_; }

 private:
  std::string string_;
};

class KelvasiModelTreeNode : public KelvasiModelNode {
 public:
  KelvasiModelTreeNode(std::string name, NodeList children)
      : KelvasiModelNode(std::move(name)), childNodes_(std::move(children)) {}
  const NodeList* childNodes() const override { return &childNodes_; }

 private:
  NodeList childNodes_;
};

// `path` with `name` appended as one component: one "/" between components, repeated separators collapsed, a
// trailing one dropped; an empty name adds nothing.
std::string pathByAppending(std::string_view path, std::string_view name);

}  // namespace kelvasi
