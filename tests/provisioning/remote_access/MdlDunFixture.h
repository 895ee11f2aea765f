#pragma once

#include "forms/headless/HeadlessDesktop.h"
#include "platform/simulated/SimulatedMachine.h"
#include "provisioning/remote_access/FullRecords.h"
#include "provisioning/remote_access/mdlDun.h"

#include <gtest/gtest.h>

namespace quendra::provisioning {

using Box = forms::headless::HeadlessDesktop::Box;
using Boxes = std::vector<Box>;
using Lines = std::vector<std::string>;

inline Box ExclamationBox(const Text& title, const Text& text) { return {text, 0x30, title}; }
inline Box RasErrorBox(const Text& call, const Text& number, const Text& description) {
  return ExclamationBox(u"  RAS API Error", u"The following error occured while calling the " + call +
                                                u" RAS API:\r\rError Number = " + number +
                                                u"\rError Description = " + description);
}
inline Box FaultBox(const Text& operation, const Text& number, const Text& description) {
  return ExclamationBox(u"  Error  -  " + description,
                        operation + u" encountered the following error:\r\rError Number = " + number +
                            u"\rError Description = " + description);
}

/// The module over a simulated machine whose dials go through the desktop's loop.
struct MdlDunFixture : testing::Test {
  forms::headless::HeadlessDesktop desktop;
  platform::simulated::SimulatedMachine machine{desktop};
  platform::simulated::SimulatedRemoteAccess& ras = machine.ras;
  mdlDun dun{{ras, ras}, machine.system, desktop};

  Text home = u"Home";
  Text none;
  Text otherNone;
  Text book = u"C:\\a.pbk";
  RasEntryRecord entry;
  RasDialParamsRecord params;

  void ExpectOneBox(const Box& box) { EXPECT_EQ(desktop.Boxes, Boxes{box}); }
};

} // namespace quendra::provisioning
