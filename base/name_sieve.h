#pragma once

#include <bitset>
#include <cstddef>
#include <string_view>
#include <vector>

// A quick first test of whether a name can equal one of a few wanted names, by its length and
// first byte, so that a folder of thousands of names hashes only those that pass. It never says
// no to a name that is wanted; it may say yes to one that is not.
class NameSieve {
public:
  // Lets through names of `name`'s length and first byte.
  void Add(std::string_view name) {
    if (name.size() >= firstBytesByLength_.size())
      firstBytesByLength_.resize(name.size() + 1);
    firstBytesByLength_[name.size()].set(FirstByte(name));
  }
  // Whether `name` may be one of the names added.
  bool MayHold(std::string_view name) const { return MayHold(name.size(), FirstByte(name)); }
  // Whether a name of `length` bytes that starts with `first` may be one of them.
  bool MayHold(size_t length, size_t first) const {
    return length < firstBytesByLength_.size() && firstBytesByLength_[length].test(first);
  }

private:
  static size_t FirstByte(std::string_view name) {
    return name.empty() ? 0 : static_cast<unsigned char>(name.front());
  }
  std::vector<std::bitset<256>> firstBytesByLength_;
};
