#include "platform/linux/net/SocketOwners.h"

#include <algorithm>

namespace quendra::platform::linux_ {

namespace {

constexpr int kMostGenerations = 16;
// How many updates a process that opened sockets stays the first place to look for more.
constexpr std::uint32_t kBusyUpdates = 8;

} // namespace

SocketOwners::SocketOwners(const ProcFolder& folder, Rights rights, Clock clock)
    : folder_(folder), rights_(rights), clock_(std::move(clock)) {}

void SocketOwners::Update(std::span<const TcpSocket> sockets) {
  now_ = clock_();
  ++update_;
  checks_ = 0;
  // Checks that fall due together are spread over the passes that follow.
  mostChecks_ = owners_.size() / 8 + 64;
  processesRead_ = 0;
  unknown_.clear();
  for (const TcpSocket& socket : sockets)
    if (socket.node != 0) Note(socket);
  ForgetMissing();
  if (!unknown_.empty()) Search();
}

std::uint32_t SocketOwners::OwnerOf(std::uint32_t socketNode) const {
  const auto found = owners_.find(socketNode);
  return found == owners_.end() ? 0 : found->second.processId;
}

void SocketOwners::Note(const TcpSocket& socket) {
  const auto [place, isNew] = owners_.try_emplace(socket.node);
  Owner& owner = place->second;
  owner.update = update_;
  if (owner.processId != 0) {
    CheckAgain(socket.node, owner);
  } else if (isNew && !rights_.everyProcess && socket.user != rights_.user) {
    // Another user's: hardly ever readable, so it waits for a search that others cause.
    owner.wait = kLastRetryMilliseconds;
    owner.due = now_ + owner.wait;
  } else if (now_ >= owner.due) {
    unknown_.insert(socket.node);
  }
}

void SocketOwners::CheckAgain(std::uint32_t node, Owner& owner) {
  if (now_ < owner.due || checks_ >= mostChecks_) return;
  ++checks_;
  if (folder_.SocketOf(owner.processId, owner.descriptor) == node) {
    owner.wait = std::min(owner.wait * 2, kLastCheckMilliseconds);
    owner.due = now_ + owner.wait;
    return;
  }
  // Handed on to a child, moved to another descriptor, or the process is gone and another still has the
  // socket.
  knownDescriptors_.erase(PlaceKey(owner.processId, owner.descriptor));
  owner = Owner{};
  owner.update = update_;
  unknown_.insert(node);
}

void SocketOwners::ForgetMissing() {
  std::erase_if(owners_, [this](const auto& entry) {
    const Owner& owner = entry.second;
    if (owner.update == update_) return false;
    if (owner.processId != 0) knownDescriptors_.erase(PlaceKey(owner.processId, owner.descriptor));
    return true;
  });
}

void SocketOwners::Search() {
  read_.clear();
  parents_.clear();
  for (const std::uint32_t processId : LikelyProcesses()) {
    SearchIn(processId);
    if (unknown_.empty()) return;
  }
  for (const std::uint32_t node : unknown_) {
    Owner& owner = owners_[node];
    owner.wait = owner.wait == 0 ? kFirstRetryMilliseconds : std::min(owner.wait * 2, kLastRetryMilliseconds);
    owner.due = now_ + owner.wait;
  }
}

/// All processes: those that opened sockets lately, those that are new, those that have sockets, the others,
/// process 1.
std::vector<std::uint32_t> SocketOwners::LikelyProcesses() {
  std::vector<ProcFolder::Place> places;
  folder_.List(places);
  std::unordered_set<std::uint32_t> having;
  for (const auto& [node, owner] : owners_) having.insert(owner.processId);

  struct Ranked {
    std::uint64_t rank;
    std::uint32_t processId;
  };
  std::vector<Ranked> ranked;
  std::unordered_map<std::uint32_t, std::uint64_t> nodes;
  std::unordered_map<std::uint32_t, std::uint32_t> finds;
  for (const auto& place : places) {
    nodes.emplace(place.processId, place.node);
    const auto find = lastFind_.find(place.processId);
    const std::uint32_t age =
        find == lastFind_.end() ? kBusyUpdates : std::min(update_ - find->second, kBusyUpdates);
    if (age < kBusyUpdates) finds.emplace(place.processId, find->second);
    const auto seen = seenNodes_.find(place.processId);
    std::uint64_t rank = age;
    if (place.processId == kFirstProcess)
      rank = kBusyUpdates + 3;
    else if (age == kBusyUpdates && seen != seenNodes_.end() && seen->second == place.node)
      rank = kBusyUpdates + (having.contains(place.processId) ? 1 : 2);
    ranked.push_back({rank, place.processId});
  }
  seenNodes_ = std::move(nodes);
  lastFind_ = std::move(finds);
  std::stable_sort(ranked.begin(), ranked.end(),
                   [](const Ranked& left, const Ranked& right) { return left.rank < right.rank; });
  std::vector<std::uint32_t> processes;
  for (const Ranked& entry : ranked) processes.push_back(entry.processId);
  return processes;
}

bool SocketOwners::SearchIn(std::uint32_t processId) {
  if (!read_.insert(processId).second) return false;
  ProcFolder::Descriptors descriptors(folder_, processId);
  ++processesRead_;
  if (!descriptors) return false;
  descriptors.List(numbers_);
  bool found = false;
  for (const std::uint32_t number : numbers_) {
    // A descriptor whose socket is still in the kernel's list needs no second look.
    if (knownDescriptors_.contains(PlaceKey(processId, number))) continue;
    const std::uint32_t node = descriptors.SocketOf(number);
    if (node == 0 || !unknown_.contains(node)) continue;
    Found(node, processId, number);
    found = true;
    if (unknown_.empty()) break;
  }
  return found;
}

void SocketOwners::Found(std::uint32_t node, std::uint32_t processId, std::uint32_t descriptor) {
  // A child has what it inherits under the number that its parent has it under.
  for (int generation = 0; generation < kMostGenerations; ++generation) {
    const std::uint32_t parent = ParentOf(processId);
    if (parent <= kFirstProcess || folder_.SocketOf(parent, descriptor) != node) break;
    processId = parent;
  }
  Owner& owner = owners_[node];
  owner.processId = processId;
  owner.descriptor = descriptor;
  owner.wait = kFirstCheckMilliseconds;
  owner.due = now_ + owner.wait;
  knownDescriptors_.insert(PlaceKey(processId, descriptor));
  lastFind_[processId] = update_;
  unknown_.erase(node);
}

std::uint32_t SocketOwners::ParentOf(std::uint32_t processId) {
  const auto [place, isNew] = parents_.try_emplace(processId, 0);
  if (isNew) {
    const auto stat = folder_.Stat(processId);
    place->second = stat ? stat->parent : 0;
  }
  return place->second;
}

} // namespace quendra::platform::linux_
