#pragma once
// A sunlit wall with box 1 ready to paint, and the plain options.
#include <gtest/gtest.h>

#include "paint/PhotoArt.h"

namespace painttest {

class PaintTest : public ::testing::Test {
protected:
    PaintTest() {
        DrawPhoto(ws, Art(Workspace::kHeight, std::string(Workspace::kWidth, 'Y')));
        ws.PictureLoaded = true;
        ws.BlendEdges = ws.ExpandEdges = false;
        ws.Boxes[1] = {"", HSLcolor::JoinColor(60, 120, 200), HSLcolor::JoinColor(200, 180, 40)};
        LoadDrawColor(ws, 1);
    }
    // A press and release without moving.
    void Dab(float x, float y) { engine.MouseDown(kLeftButton, x, y); engine.MouseUp(kLeftButton, x, y); }
    Workspace ws;
    FakeHost host{ws};
    PaintEngine engine{ws, host};
};

} // namespace painttest
