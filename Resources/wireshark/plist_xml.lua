-- SPDX-License-Identifier: GPL-2.0-or-later
-- XML property lists.
do
  local sub, find = string.sub, string.find
  local entities = {lt = "<", gt = ">", amp = "&", quot = '"', apos = "'"}

  local function plain(text)
    return (text:gsub("&(#?x?)(%w+);", function(mark, name)
      if mark == "" then return entities[name] end
      local code = tonumber(name, mark == "#x" and 16 or 10)
      return code and code < 0x110000 and kelvasi.utf8_of(code) or nil
    end))
  end

  -- The first tag from `from` on: {name, ends, is_empty, first, after}. Comments and declarations are none.
  local function tag_from(text, from)
    while true do
      local first, last, mark, name, rest = find(text, "<([/?!]?)([%w%-%[]*)([^>]*)>", from)
      if not first then return nil end
      if mark == "" or mark == "/" then
        return {name = name, ends = mark == "/", is_empty = sub(rest, -1) == "/", first = first, after = last + 1}
      end
      if mark == "!" and sub(name, 1, 2) == "--" then _, last = find(text, "-->", first, true) end
      if not last then return nil end
      from = last + 1
    end
  end

  local alphabet = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/"
  local function unpacked(text)
    local bits, count, bytes = 0, 0, {}
    for each in text:gmatch("[%w+/]") do
      bits, count = bits * 64 + find(alphabet, each, 1, true) - 1, count + 6
      if count >= 8 then
        count = count - 8
        bytes[#bytes + 1] = string.char(math.floor(bits / 2 ^ count) % 256)
        bits = bits % 2 ^ count
      end
    end
    return table.concat(bytes)
  end

  local leaves = {
    string = plain,
    date = function(text) return text end,
    integer = function(text) return text:match("^%s*([+-]?%w+)%s*$") end,
    real = tonumber,
    data = unpacked,
  }

  -- The text of an element, and what follows that.
  local function text_of(text, tag)
    if tag.is_empty then return "", tag.after end
    local first, last = find(text, "</" .. tag.name .. "%s*>", tag.after)
    if first then return sub(text, tag.after, first - 1), last + 1 end
  end

  local element

  -- Calls `take` with each tag below the element; returns what follows the element, nil where it is not whole.
  local function each_child(text, tag, take)
    if tag.is_empty then return tag.after end
    local at = tag.after
    while at do
      local child = tag_from(text, at)
      if not child then return nil end
      if child.ends then return child.after end
      at = take(child)
    end
  end

  local function array(text, tag, depth, left)
    local elements = {}
    return elements, each_child(text, tag, function(child)
      local node, after = element(text, child, depth + 1, left)
      elements[#elements + 1] = node
      return after
    end)
  end

  local function dict(text, tag, depth, left)
    local entries, key = {}, nil
    return entries, each_child(text, tag, function(child)
      if child.name == "key" then
        local raw, after = text_of(text, child)
        key = raw and plain(raw)
        return after
      end
      local node, after = element(text, child, depth + 1, left)
      if not key then return nil end
      entries[#entries + 1], key = {key, node}, nil
      return after
    end)
  end

  local containers = {array = array, dict = dict}

  -- The element of a tag, and what follows it; nil where it is not whole, or too much.
  function element(text, tag, depth, left)
    left.nodes = left.nodes - 1
    if depth > kelvasi.deepest or left.nodes < 0 then return nil end
    local node, after = {kind = tag.name, at = tag.first - 1}, nil
    if containers[tag.name] then
      node.value, after = containers[tag.name](text, tag, depth, left)
    else
      local raw
      raw, after = text_of(text, tag)
      if tag.name == "true" or tag.name == "false" then
        node.kind, node.value = "boolean", tag.name == "true"
      elseif raw and leaves[tag.name] then
        node.value = leaves[tag.name](raw)
      end
    end
    if not after or node.value == nil then return nil end
    node.size = after - tag.first
    return node, after
  end

  function kelvasi.xml_plist(text)
    local tag = tag_from(text, 1)
    if tag and tag.name == "plist" then tag = tag_from(text, tag.after) end
    return tag and not tag.ends and (element(text, tag, 0, {nodes = kelvasi.most_nodes})) or nil
  end
end
