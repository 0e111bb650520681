#pragma once
// The painting engine's test fixture: a fake window that records what the
// engine asks of it, and a sunlit wall with box 1 ready to paint.
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "paint/PaintEngine.h"
#include "paint/PhotoArt.h"

namespace painttest {

class FakeHost : public PaintHost {
public:
    explicit FakeHost(Workspace& ws) : ws_(ws) {}
    void RefreshPicture() override { ++refreshes; }
    void ToolStateChanged() override {}
    void Warning(const std::string& title, const std::string& text) override { warnings.push_back(title + "|" + text); }
    void PumpEvents() override { ++pumps; }
    void SelectColorBox(int index) override {
        selected.push_back(index);
        ws_.CurrentColor = static_cast<int16_t>(index);
        LoadDrawColor(ws_, index);
    }
    int refreshes = 0, pumps = 0;
    std::vector<std::string> warnings;  // "title|text"
    std::vector<int> selected;

private:
    Workspace& ws_;
};

class PaintTest : public ::testing::Test {
protected:
    PaintTest() : ws_ptr(std::make_unique<Workspace>()), ws(*ws_ptr), host(ws), engine(ws, host) {
        FillPhoto(ws, 'Y');
        ws.PictureLoaded = true;
        ws.BlendEdges = ws.ExpandEdges = false;
        GiveBox(1, HSLcolor::JoinColor(60, 120, 200), HSLcolor::JoinColor(200, 180, 40));
        LoadDrawColor(ws, 1);
    }
    void GiveBox(int i, int32_t color, int32_t reference) {
        ws.Boxes[static_cast<size_t>(i)].color = color;
        ws.Boxes[static_cast<size_t>(i)].reference = reference;
    }
    // A press and release without moving.
    void Dab(float x, float y, int button = kLeftButton) {
        engine.MouseDown(button, x, y);
        engine.MouseUp(button, x, y);
    }
    std::unique_ptr<Workspace> ws_ptr;
    Workspace& ws;
    FakeHost host;
    PaintEngine engine;
};

} // namespace painttest
