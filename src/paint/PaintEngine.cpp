// Placeholder bodies: the painting engine is built in the files beside this one.
#include "paint/PaintEngine.h"

void PaintEngine::MouseDown(int, float, float) {}
void PaintEngine::MouseMove(int, float, float) {}
void PaintEngine::MouseUp(int, float, float) {}
void PaintEngine::RollerAt(int, int) {}
bool PaintEngine::PaintPixel(int, int) { return false; }
void PaintEngine::UpdateMatchColor(int, int) {}
void PaintEngine::RecolorPixel(int, int) {}
void PaintEngine::RepaintColor(int) {}
void PaintEngine::RenderEdges(int) {}
void PaintEngine::BlendOutsidePixel(int, int, int) {}
void PaintEngine::BlendBoundaryPixel(int&, int&) {}
void PaintEngine::RefreshAll() {}
void PaintEngine::UndoStroke() {}
void PaintEngine::RedoStroke() {}
void PaintEngine::ClearAll() {}
void PaintEngine::ExpandEdges() {}
void PaintEngine::EraseAt(int, int) {}
void PaintEngine::DrawChalkLine(bool, bool) {}
