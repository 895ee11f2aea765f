#include "platform/windows/capture/WindowsCaptureAdapters.h"

#include "platform/windows/capture/LinkPoll.h"
#include "platform/windows/capture/WpcapSession.h"
#include "platform/windows/net/AnsiText.h"

#include <algorithm>

namespace quendra::platform::windows {

namespace {

LiveAdapter AdapterOf(const PcapDevice& device, const CaptureLink& link) {
  LiveAdapter adapter;
  adapter.name = device.name;
  adapter.description = ToUtf8(link.description);
  adapter.number = link.index;
  adapter.hasDefaultRoute = link.hasDefaultRoute;
  adapter.isLoopback = link.isLoopback;
  return adapter;
}

LiveAdapter UnusedAdapter(const PcapDevice& device) {
  LiveAdapter adapter;
  adapter.name = device.name;
  adapter.description = device.description != nullptr ? ToUtf8(FromAnsi(device.description)) : adapter.name;
  return adapter;
}

} // namespace

/// The library's driver may be reserved for administrators; only opening an adapter tells.
bool WindowsCaptureAdapters::MayCapture() const {
  if (mayCapture_) return true;
  for (const LiveAdapter& adapter : List()) {
    if (adapter.number == 0) continue;
    char error[kPcapErrorBytes] = "";
    PcapHandle* handle = library_.open_live(adapter.name.c_str(), FrameShaper::kMostBytes, 0, 1, error);
    if (handle == nullptr) continue;
    library_.close(handle);
    return mayCapture_ = true;
  }
  return false;
}

std::vector<LiveAdapter> WindowsCaptureAdapters::List() const {
  char error[kPcapErrorBytes] = "";
  PcapDevice* devices = nullptr;
  if (library_.findalldevs(&devices, error) != 0) devices = nullptr;
  const std::unique_ptr<PcapDevice, decltype(library_.freealldevs)> owner(devices, library_.freealldevs);
  const auto links = ReadCaptureLinks(ipHelper_).value_or(std::vector<CaptureLink>());
  std::vector<LiveAdapter> adapters;
  for (const PcapDevice* device = devices; device != nullptr; device = device->next) {
    const CaptureLink* link = LinkOfDevice(links, device->name);
    if (link != nullptr && link->isUp) adapters.push_back(AdapterOf(*device, *link));
  }
  if (adapters.empty() && devices != nullptr) adapters.push_back(UnusedAdapter(*devices));
  return adapters;
}

unsigned WindowsCaptureAdapters::NumberIfUp(const std::string& name) const {
  const auto links = ReadCaptureLinks(ipHelper_).value_or(std::vector<CaptureLink>());
  const CaptureLink* link = LinkOfDevice(links, name);
  return link != nullptr && link->isUp ? link->index : 0;
}

Ipv4Address WindowsCaptureAdapters::AddressOf(const std::string& name) const {
  const auto links = ReadCaptureLinks(ipHelper_).value_or(std::vector<CaptureLink>());
  const CaptureLink* link = LinkOfDevice(links, name);
  return link != nullptr ? link->address : Ipv4Address();
}

std::unique_ptr<FrameSource> WindowsCaptureAdapters::Open(const std::string& name, FrameShaper& shaper) {
  return WpcapSession::Open(library_, loop_, name, shaper);
}

std::unique_ptr<EventLoop::Subscription> WindowsCaptureAdapters::Watch(std::function<void()> changed) {
  return std::make_unique<LinkPoll>(
      loop_, [this] { return ReadCaptureLinks(ipHelper_); }, std::move(changed));
}

} // namespace quendra::platform::windows
