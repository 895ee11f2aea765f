#pragma once

#include "integration/Worker.h"

namespace quendra::integration {

/// A client process's work: connections to one server and what goes over them.
class TrafficClient {
 public:
  TrafficClient(std::string serverAddress, std::uint16_t port)
      : address_(std::move(serverAddress)), port_(port) {}
  /// Obeys the orders of the channel until it closes.
  void Run(int channel);

 private:
  int Connect() const;
  std::vector<std::uint16_t> Obey(const Order& order);
  std::vector<std::uint16_t> MakeConnections(int count);
  void Exchanges(const Order& order) const;
  void ShortConnections(const Order& order) const;
  void Datagrams(const Order& order) const;

  std::string address_;
  std::uint16_t port_;
  std::vector<int> connections_;
};

} // namespace quendra::integration
