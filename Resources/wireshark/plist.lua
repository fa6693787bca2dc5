-- SPDX-License-Identifier: GPL-2.0-or-later
-- Property lists, as a daemon sends them. A node is {kind, value, at, size}; a dictionary's value is a list of
-- {key, node}, an array's one of nodes, an integer's its decimal digits. What is none is nil.
do
  kelvasi.deepest, kelvasi.most_nodes = 64, 20000  -- what is beyond is none to us

  function kelvasi.utf8_of(code)
    if code < 0x80 then return string.char(code) end
    local bytes, first, limit = "", 0x80, 0x40
    repeat
      bytes = string.char(0x80 + code % 64) .. bytes
      code, limit = math.floor(code / 64), limit / 2
      first = first / 2 + 0x80
    until code < limit
    return string.char(first + code) .. bytes
  end

  -- Of the entries with one key the last counts, at the place of the first.
  local function settle(node)
    if node.kind == "array" then
      for _, value in ipairs(node.value) do settle(value) end
    elseif node.kind == "dict" then
      local places, entries = {}, {}
      for _, entry in ipairs(node.value) do
        local place = places[entry[1]] or #entries + 1
        places[entry[1]], entries[place] = place, entry
        settle(entry[2])
      end
      node.value = entries
    end
    return node
  end

  -- Padding may stand behind a list; that of a binary one is told from its last bytes by trying.
  function kelvasi.plist_of(text)
    local trimmed = text:match("^(.-)[%z \t\r\n]*$")
    local node
    if text:sub(1, 8) == "bplist00" then
      node = kelvasi.binary_plist(text) or kelvasi.binary_plist(trimmed)
    else
      node = kelvasi.xml_plist(trimmed)
    end
    return node and settle(node)
  end

  function kelvasi.is_plist(text)
    return text:sub(1, 8) == "bplist00" or text:find("^%s*<") ~= nil
  end
end
