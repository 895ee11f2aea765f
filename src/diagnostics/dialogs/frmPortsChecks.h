#pragma once

#include "forms/FormHost.h"
#include "forms/controls/Controls.h"
#include "foundation/CSocketPlus.h"

#include <array>
#include <memory>

namespace quendra::diagnostics {

/// The dialog that tries the three ports that matter, all at once, and shows for each how much came back or
/// what went wrong.
class frmPortsChecks : public forms::Form {
 public:
  frmPortsChecks(forms::FormHost& forms, foundation::modSocketPlus& module);

  void Design() override;
  void Form_Load() override;
  void Form_Unload() override { ReleaseSockets(); }

  forms::Label Label1{*this, u"Label1"};
  forms::Label Label3{*this, u"Label3"};
  forms::Label Label2{*this, u"Label2"};
  forms::Label Label4{*this, u"Label4"};
  forms::Label Label5{*this, u"Label5"};
  forms::Label Label6{*this, u"Label6"};
  forms::CommandButton Command1{*this, u"Command1"};
  forms::CommandButton Command2{*this, u"Command2"};

  /// nullptr while the dialog isn't loaded.
  foundation::CSocketPlus* Sockets() { return spSockets_.get(); }

 private:
  using Index = const Variant&;

  struct Probe {
    const char16_t* host;
    std::int16_t port;
    const char16_t* request;
    /// Shows what came of it; its Tag holds the amount in kilobytes.
    forms::Label& result;
  };

  void Command1_Click();
  void PrepareSockets();
  void ReleaseSockets();
  /// nullptr for an index that no probe has.
  const Probe* ProbeOf(Index index) const;

  void spSockets_Connect(Index index);
  void spSockets_DataArrival(Index index, std::int32_t bytesTotal);
  void spSockets_Error(Index index, std::int16_t number, const Text& description);

  forms::FormHost& forms_;
  foundation::modSocketPlus& module_;
  /// Their indexes are their places, from 1.
  const std::array<Probe, 3> probes_;
  std::shared_ptr<foundation::CSocketPlus> spSockets_;
};

} // namespace quendra::diagnostics
