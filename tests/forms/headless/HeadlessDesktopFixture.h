#pragma once

#include "forms/headless/HeadlessDesktop.h"

#include <gtest/gtest.h>

namespace quendra::forms::headless {

struct MainForm : Form {
  MainForm() : Form(u"frmMenu") {}
  void Design() override {
    Move(0, 0, 6000, 3000);
    picture.Move(0, 0, 1500, 750);
    buffer.Move(0, 0, 1500, 750);
    buffer.ScaleMode = ScaleMode::Pixels;
  }
  void Form_KeyDown(int keyCode, int shift) override { keys.push_back(keyCode * 10 + shift); }

  Frame page{*this, u"frameMain"};
  Label label{page, u"lblCaption"};
  PictureBox picture{*this, u"picOut"};
  PictureBox buffer{*this, u"picBuffer"};
  ComboBox combo{page, u"main_cmbAdapters"};
  ListView list{page, u"main_ListView1"};
  Timer timer{*this, u"Timer1", 10, false};
  std::vector<int> keys;
};

struct HeadlessDesktopTest : testing::Test {
  HeadlessDesktopTest() { desktop.Show(form); }
  HeadlessDesktop desktop;
  MainForm form;
};

} // namespace quendra::forms::headless
