#pragma once

#include "platform/net/HostNames.h"
#include "platform/net/IpHelper.h"
#include "platform/net/SocketNumbers.h"
#include "platform/process/Handles.h"
#include "platform/simulated/SimulatedCore.h"

#include <array>
#include <deque>
#include <optional>

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

/// A TCP connection: addresses are dotted texts, ports plain numbers.
struct Connection {
  std::uint32_t state = kTcpEstablished;
  std::string localAddress{};
  std::uint16_t localPort = 0;
  std::string remoteAddress = "0.0.0.0";
  std::uint16_t remotePort = 0;
  std::uint32_t owner = 0;
};

class SimulatedIpHelper : public IpHelper {
 public:
  std::vector<Connection> Connections;
  /// Other than 0: what AllocateAndGetTcpExTableFromStack fails with.
  std::uint32_t TableError = 0;
  int TablesFetched = 0;
  /// The records that SetTcpEntry was given.
  std::vector<std::array<std::uint8_t, 20>> Deleted;
  std::uint32_t SetTcpEntryResult = 0;
  std::vector<AdapterRecord> Adapters;
  /// Other than 0: what GetAdaptersInfo fails with.
  std::uint32_t AdaptersError = 0;

  std::uint32_t AllocateAndGetTcpExTableFromStack(TcpTable& table) override;
  std::uint32_t SetTcpEntry(std::span<const std::uint8_t, 20> record) override;
  std::uint32_t GetAdaptersInfo(std::vector<AdapterRecord>& adapters, std::uint32_t& size) override;
};

/// The host's own name is known, and those that were added.
class SimulatedHostNames : public HostNames {
 public:
  std::string Name = "subscriber";
  std::vector<std::string> Addresses;
  /// Another name and its addresses.
  void Add(const std::string& name, std::vector<std::string> addresses) {
    others_[name] = std::move(addresses);
  }
  bool FailName = false;
  bool FailAddresses = false;
  /// What a question fails with.
  std::int32_t Error = kHostNotFound;

  std::optional<std::string> gethostname() override;
  std::optional<std::vector<Ipv4Address>> gethostbyname(const std::string& name) override;
  std::int32_t LastError() override { return lastError_; }

 private:
  std::int32_t lastError_ = 0;
  std::map<std::string, std::vector<std::string>> others_;
};

} // namespace quendra::platform::simulated
