// What the browser keeps for the page: one item for a value.
const storage = (function () {
  /** Null where the browser keeps nothing. */
  function items() {
    try {
      return window.localStorage;
    } catch (error) {
      return null;
    }
  }

  function put(kept, name, value) {
    if (value === null) kept.removeItem(name);
    else kept.setItem(name, value);
  }

  /** Stores [name, value] pairs, or throws and leaves all as it was. */
  function putAll(kept, pairs) {
    const old = pairs.map(function (pair) { return [pair[0], kept.getItem(pair[0])]; });
    try {
      pairs.forEach(function (pair) { put(kept, pair[0], pair[1]); });
    } catch (error) {
      old.forEach(function (pair) { put(kept, pair[0], null); });
      old.forEach(function (pair) { put(kept, pair[0], pair[1]); });
      throw error;
    }
  }

  return {
    /** Rest of a name, value, and so on, each with a zero character behind it; null: none is kept. */
    read: function (beginning) {
      const kept = items();
      if (!kept) return null;
      return Object.keys(kept)
        .filter(function (name) { return name.startsWith(beginning); })
        .map(function (name) { return name.slice(beginning.length) + '\0' + kept.getItem(name) + '\0'; })
        .join('');
    },

    /** Stores such a list, split at the zero characters: all of it, or nothing and false. */
    write: function (beginning, list) {
      const pairs = [];
      for (let i = 0; i + 1 < list.length; i += 2) pairs.push([beginning + list[i], list[i + 1]]);
      try {
        putAll(items(), pairs);
        return true;
      } catch (error) {
        return false;
      }
    },
  };
})();
