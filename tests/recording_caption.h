#pragma once

#include "app/caption.h"

#include <string>
#include <vector>

// A caption that keeps every text it is given, so that tests can check the progress shown.
class RecordingCaption : public Caption {
public:
  std::string Get() const override { return text; }
  void Set(const std::string &newText) override {
    text = newText;
    shown.push_back(newText);
  }

  std::string text = "Selector";
  std::vector<std::string> shown;
};
