// Zel_MemoryLimits: the limits the in-memory server enforces.
//
// A request that would go beyond one fails (the code is named with each
// limit), and a tree file beyond one is refused when it is loaded, so every
// tree the server builds can be saved, loaded back and read without limits
// of its own getting in the way. The values are part of the backend's
// behaviour, like its error codes.
#ifndef ZEL_MEMORYLIMITS_H
#define ZEL_MEMORYLIMITS_H

namespace Zel_MemoryLimits {

// The longest asset name, in UTF-16 code units (InvalidName). Names also must
// not contain "/", which separates the names of a path.
const int MaxNameLength = 128;

// The deepest a node may lie below the root: the root lies at depth 0, its
// children at 1 (TooDeep, from create, move, copy and check-in). The tree
// file spends two JSON nesting levels per tree level (a node object and its
// children array), so a tree at this limit stays far inside the 1024 levels
// the JSON reader accepts.
const int MaxDepth = 128;

// Settings documents (SetUserSettings, SetApplicationSettings, SaveSettings;
// InvalidArgument), and the settings of tree files:
// - element levels below the root element, which are the levels of a key;
const int MaxSettingsLevels = 64;
// - the length of a key (its levels joined by "."), in UTF-16 code units;
const int MaxSettingsKeyLength = 1024;
// - the number of settings (leaf elements with distinct keys);
const int MaxSettingsCount = 10000;
// - the length of the document text, and of all keys and values of the
//   settings together, in UTF-16 code units.
const int MaxSettingsSize = 1 << 20;

} // namespace Zel_MemoryLimits

#endif
