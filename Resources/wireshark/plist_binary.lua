-- SPDX-License-Identifier: GPL-2.0-or-later
-- Binary property lists ("bplist00"): objects, then a table of where each begins, then a trailer of 32 bytes.
do
  local byte, sub = string.byte, string.sub

  local function number_at(text, at, count)
    local number = 0
    for place = at + 1, at + count do number = number * 256 + (byte(text, place) or 0) end
    return number
  end

  -- Of eight bytes with a sign, of sixteen without, in digits: a number of Lua does not hold them.
  local function integer_at(text, at, count)
    if count < 8 then return string.format("%d", number_at(text, at, count)) end
    local from = at + count - 8
    local make = count == 8 and Int64.new or UInt64.new
    return tostring(make(number_at(text, from + 4, 4), number_at(text, from, 4)))
  end

  local function real_at(text, at, count)
    local packed = sub(text, at + 1, at + count)
    return #packed == count and (Struct.unpack(count == 4 and ">f" or ">d", packed)) or nil
  end

  local function utf16_at(text, at, count)
    local parts, place = {}, 0
    while place < count do
      local code = number_at(text, at + 2 * place, 2)
      if code >= 0xD800 and code < 0xDC00 then
        place = place + 1
        code = 0x10000 + (code - 0xD800) * 1024 + number_at(text, at + 2 * place, 2) % 1024
      end
      parts[#parts + 1] = kelvasi.utf8_of(code)
      place = place + 1
    end
    return table.concat(parts)
  end

  local function date_at(text, at)
    local seconds = real_at(text, at, 8)
    if not seconds or not (seconds > -6e10 and seconds < 2e11) then return nil end
    return os.date("!%Y-%m-%dT%H:%M:%SZ", 978307200 + math.floor(seconds))  -- since 2001
  end

  -- By the upper half of the marker: the kind, the value and its size, of `count` and the bytes from `at` on.
  local leaves = {
    [0] = function(_, _, count)
      if count == 8 or count == 9 then return "boolean", count == 9, 0 end
    end,
    [1] = function(text, at, count)
      if count <= 4 then return "integer", integer_at(text, at, 2 ^ count), 2 ^ count end
    end,
    [2] = function(text, at, count)
      if count == 2 or count == 3 then return "real", real_at(text, at, 2 ^ count), 2 ^ count end
    end,
    [3] = function(text, at, count)
      if count == 3 then return "date", date_at(text, at), 8 end
    end,
    [4] = function(text, at, count) return "data", sub(text, at + 1, at + count), count end,
    [5] = function(text, at, count) return "string", sub(text, at + 1, at + count), count end,
    [6] = function(text, at, count)
      if at + 2 * count <= #text then return "string", utf16_at(text, at, count), 2 * count end
    end,
  }
  local containers = {[10] = "array", [13] = "dict"}

  -- Where sizes, the objects and their table are; nil where they are not inside the list.
  local function trailer_of(text)
    local at = #text - 32
    if at < 8 then return nil end
    local about = {offset_size = byte(text, at + 7), reference_size = byte(text, at + 8),
                   objects = number_at(text, at + 8, 8), top = number_at(text, at + 16, 8),
                   offsets = number_at(text, at + 24, 8), left = kelvasi.most_nodes}
    local sizes_are_good = about.offset_size >= 1 and about.offset_size <= 8 and about.reference_size >= 1 and
                           about.reference_size <= 8
    return sizes_are_good and about.offsets + about.objects * about.offset_size <= at and about or nil
  end

  -- What stands in the lower half of the marker, or as an integer behind it, and what follows.
  local function count_at(text, at, sort)
    local count = byte(text, at + 1) % 16
    if count ~= 15 or sort < 4 then return count, at + 1 end
    local power = (byte(text, at + 2) or 0) % 16
    if power > 3 then return nil end
    return number_at(text, at + 2, 2 ^ power), at + 2 + 2 ^ power
  end

  local object

  local function children(text, about, node, at, count, depth)
    local keys = node.kind == "dict" and count or 0
    if at + (keys + count) * about.reference_size > about.offsets then return nil end
    local function child(place)
      return object(text, about, number_at(text, at + place * about.reference_size, about.reference_size), depth + 1)
    end
    for place = 0, count - 1 do
      local value, key = child(keys + place), keys > 0 and child(place) or nil
      if not value or (keys > 0 and not (key and key.kind == "string")) then return nil end
      node.value[#node.value + 1] = key and {key.value, value} or value
    end
    return node
  end

  function object(text, about, index, depth)
    about.left = about.left - 1
    if about.left < 0 or depth > kelvasi.deepest or index >= about.objects then return nil end
    local at = number_at(text, about.offsets + index * about.offset_size, about.offset_size)
    if at < 8 or at >= about.offsets then return nil end
    local sort = math.floor(byte(text, at + 1) / 16)
    local count, body = count_at(text, at, sort)
    if not count or count > #text then return nil end
    local node = {at = at, size = body - at}
    if containers[sort] then
      node.kind, node.value = containers[sort], {}
      return children(text, about, node, body, count, depth)
    end
    local size
    if leaves[sort] then node.kind, node.value, size = leaves[sort](text, body, count) end
    node.size = node.size + (size or 0)
    return node.value ~= nil and node or nil
  end

  function kelvasi.binary_plist(text)
    local about = trailer_of(text)
    return about and object(text, about, about.top, 0)
  end
end
