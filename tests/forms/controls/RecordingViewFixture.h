#pragma once

#include "forms/Form.h"
#include "forms/controls/ListView.h"

#include <string>
#include <vector>

namespace quendra::forms {

/// Writes down what a control tells its view.
struct RecordingView : ControlView {
  void Changed(Aspect aspect) override { told.push_back(aspect); }
  void ControlGone() override { gone = true; }
  std::vector<Aspect> told;
  bool gone = false;
};

/// Writes down what a list tells its observer, as in "added 1", "changed 2.4".
struct RecordingObserver : ListViewObserver {
  void RowAdded(int index) override { Say("added " + std::to_string(index)); }
  void RowRemoved(int index) override { Say("removed " + std::to_string(index)); }
  void RowChanged(int index, int cell) override {
    Say("changed " + std::to_string(index) + "." + std::to_string(cell));
  }
  void RowsMoved() override { Say("moved"); }
  void RowsCleared() override { Say("cleared"); }
  void ColumnsChanged() override { Say("columns"); }

  std::vector<std::string> told;

 private:
  void Say(std::string what) { told.push_back(std::move(what)); }
};

/// A form without anything on it.
struct BareForm : Form {
  BareForm() : Form(u"frmBare") {}
  void Design() override {}
};

} // namespace quendra::forms
