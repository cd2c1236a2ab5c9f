#pragma once

#include <QLockFile>
#include <filesystem>
#include <memory>

// Holds the one-instance lock of a game folder; a lock left by a crashed instance is stale and
// taken over.
class InstanceLock {
public:
  explicit InstanceLock(const std::filesystem::path &eawDir);
  // Whether no other instance runs for the game folder.
  bool Acquired() const { return acquired_; }

private:
  std::unique_ptr<QLockFile> lock_;
  bool acquired_ = false;
};
