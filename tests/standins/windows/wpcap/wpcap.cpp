// A wpcap.dll for tests: its devices and frames are those of a script, which the test has of it by
// StandInScript, or recorded where the environment says so. One thread.

#include "standins/windows/wpcap/RecordedFrames.h"

#include "platform/windows/capture/WpcapTypes.h"

#include <algorithm>
#include <memory>

namespace quendra::platform::windows {

/// A capture that is open.
struct PcapHandle {
  standins::WpcapScript::Device* device;
};

} // namespace quendra::platform::windows

namespace {

using namespace quendra::platform::windows;
using quendra::standins::WpcapScript;

WpcapScript& Script() {
  static WpcapScript script{.devices = quendra::standins::RecordedDevices()};
  return script;
}

WpcapScript::Device* DeviceNamed(const std::string& name) {
  auto& devices = Script().devices;
  const auto found = std::ranges::find(devices, name, &WpcapScript::Device::name);
  return found == devices.end() ? nullptr : &*found;
}

} // namespace

#define EXPORTED extern "C" __declspec(dllexport)

EXPORTED WpcapScript* StandInScript() { return &Script(); }

EXPORTED int pcap_findalldevs(PcapDevice** devices, char* error) {
  *devices = nullptr;
  *error = '\0';
  if (!Script().canList) return -1;
  PcapDevice** end = devices;
  for (auto& device : Script().devices) {
    char* const description = device.description.empty() ? nullptr : device.description.data();
    *end = new PcapDevice{nullptr, device.name.data(), description, nullptr, 0};
    end = &(*end)->next;
  }
  return 0;
}

EXPORTED void pcap_freealldevs(PcapDevice* devices) {
  while (devices != nullptr) {
    const std::unique_ptr<PcapDevice> gone(devices);
    devices = gone->next;
  }
}

EXPORTED PcapHandle* pcap_open_live(const char* name, int snapshot, int promiscuous, int, char* error) {
  WpcapScript::Device* device = DeviceNamed(name);
  *error = '\0';
  if (device == nullptr || !device->canBeOpened) return nullptr;
  ++device->open;
  quendra::standins::PassOverRecordedFrames(*device);
  device->snapshot = snapshot;
  device->promiscuous = promiscuous;
  device->isNonBlocking = false;
  return new PcapHandle{device};
}

EXPORTED void pcap_close(PcapHandle* handle) {
  --handle->device->open;
  delete handle;
}

EXPORTED int pcap_datalink(PcapHandle* handle) { return handle->device->linkType; }

EXPORTED int pcap_setbuff(PcapHandle* handle, int bytes) {
  handle->device->bufferBytes = bytes;
  return 0;
}

EXPORTED int pcap_compile(PcapHandle*, PcapProgram* program, const char* text, int, unsigned) {
  program->instructions = new std::string(text);
  program->length = 1;
  return 0;
}

EXPORTED int pcap_setfilter(PcapHandle* handle, PcapProgram* program) {
  handle->device->filter = *static_cast<std::string*>(program->instructions);
  return 0;
}

EXPORTED void pcap_freecode(PcapProgram* program) { delete static_cast<std::string*>(program->instructions); }

EXPORTED int pcap_setnonblock(PcapHandle* handle, int nonBlocking, char*) {
  handle->device->isNonBlocking = nonBlocking != 0;
  return 0;
}

EXPORTED int pcap_stats(PcapHandle* handle, PcapStatistics* statistics) {
  statistics->dropped = handle->device->dropped;
  return 0;
}

EXPORTED int pcap_dispatch(PcapHandle* handle, int most, PcapCallback* callback, unsigned char* user) {
  WpcapScript::Device& device = *handle->device;
  if (device.fails) return -1;
  quendra::standins::TakeRecordedFrames(device, most);
  int count = 0;
  for (; count < most && !device.waiting.empty(); ++count) {
    const auto frame = std::move(device.waiting.front());
    device.waiting.pop_front();
    const auto wire = static_cast<unsigned>(frame.size());
    const PcapHeader header{1000, 500, std::min(wire, static_cast<unsigned>(device.snapshot)), wire};
    callback(user, &header, frame.data());
  }
  return count;
}
