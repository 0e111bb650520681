#pragma once
#include <QPainter>
#include <QRect>
#include <functional>

#include "paint/Picture.h"

// Draws with QPainter onto part of a picture buffer: the region is copied
// into an image, drawn on in picture coordinates, and copied back. Pixels
// outside the region are never touched.
void PaintPicture(Picture& picture, const QRect& region, const std::function<void(QPainter&)>& draw);
