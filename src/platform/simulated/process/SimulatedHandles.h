#pragma once

#include "platform/process/Handles.h"
#include "platform/simulated/SimulatedCore.h"

#include <deque>

namespace quendra::platform::simulated {

/// A handle of some process, as the native interface lists it.
struct SystemHandle {
  std::uint32_t pid = 0;
  std::uint16_t handle = 0;
  std::u16string deviceName{};    ///< such as u"\\Device\\Tcp"; empty for an object without a name
  std::uint16_t port = 0;         ///< what the transport driver answers
  bool duplicable = true;         ///< false: DuplicateHandle fails
  std::uint32_t driverStatus = 0; ///< what the transport driver's query ends with
};

class SimulatedHandles : public Handles {
 public:
  explicit SimulatedHandles(Core& core) : core_(core) {}

  void Add(SystemHandle handle) { handles_.push_back(std::move(handle)); }
  /// Opened by someone right after the next query of the table; further calls wait for the queries after it.
  void AppearAfterNextQuery(std::vector<SystemHandle> handles) { appearing_.push_back(std::move(handles)); }
  /// The buffer sizes of all queries of the table.
  std::vector<std::size_t> TableQueries;
  int NameQueries = 0;
  int DriverQueries = 0;

  std::uint32_t NtQuerySystemInformation(std::uint32_t informationClass, std::span<std::uint8_t> buffer,
                                         std::uint32_t& returnedLength) override;
  bool DuplicateHandle(Handle sourceProcess, Handle handle, Handle targetProcess, Handle& duplicate,
                       std::uint32_t access, bool inherit, std::uint32_t options) override;
  std::uint32_t NtQueryObject(Handle handle, std::uint32_t informationClass, std::span<std::uint8_t> buffer,
                              std::uint32_t& returnedLength) override;
  Handle CreateEventW(bool manualReset, bool initialState, const std::u16string& name) override;
  std::uint32_t NtDeviceIoControlFile(Handle handle, Handle event, std::uint32_t controlCode,
                                      std::span<const std::uint8_t> input,
                                      std::span<std::uint8_t> output) override;

 private:
  const SystemHandle* Duplicated(Handle handle) const;

  Core& core_;
  std::vector<SystemHandle> handles_;
  std::deque<std::vector<SystemHandle>> appearing_;
};

} // namespace quendra::platform::simulated
