#pragma once

#include <filesystem>

// Holds the one-instance lock of a game folder while it lives. The system itself releases the lock
// when the process ends in any way, so a crashed or killed instance never keeps the next one out.
class InstanceLock {
public:
  explicit InstanceLock(const std::filesystem::path &eawDir);
  ~InstanceLock();
  InstanceLock(const InstanceLock &) = delete;
  InstanceLock &operator=(const InstanceLock &) = delete;
  // Whether no other instance runs for the game folder; a lock that cannot be made at all (no
  // temporary folder) does not count as another instance.
  bool Acquired() const { return acquired_; }

private:
#ifdef _WIN32
  void *handle_;
#else
  int fd_ = -1;
#endif
  bool acquired_ = false;
};
