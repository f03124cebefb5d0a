// An 8-bit palettised drawing surface and the primitives the art is drawn with.
#pragma once

#include <cstdint>
#include <functional>
#include <vector>

#include "tools/packgen/palette.h"

namespace packgen {

struct Point {
    double x, y;
};

class Canvas {
public:
    Canvas() = default;
    Canvas(int w, int h, std::uint8_t fill = kKey);

    int width() const { return w_; }
    int height() const { return h_; }
    const std::vector<std::uint8_t>& pixels() const { return px_; }

    bool inside(int x, int y) const { return x >= 0 && y >= 0 && x < w_ && y < h_; }
    std::uint8_t get(int x, int y) const { return inside(x, y) ? px_[y * w_ + x] : kKey; }
    void set(int x, int y, std::uint8_t c) {
        if (inside(x, y)) {
            px_[y * w_ + x] = c;
        }
    }
    // Blends a colour over the pixel with coverage a; over the key the colour is mixed with
    // `overKey` instead (the colour the picture will later be drawn onto).
    void blend(int x, int y, Rgb c, double a, Rgb overKey);
    void blend(int x, int y, Rgb c, double a) { blend(x, y, c, a, c); }

    void fill(std::uint8_t c);
    void rect(int x, int y, int w, int h, std::uint8_t c);
    void frame(int x, int y, int w, int h, std::uint8_t c);
    // Calls shade(x, y) for every pixel of the rectangle and stores what it returns.
    void paint(int x, int y, int w, int h, const std::function<std::uint8_t(int, int)>& shade);
    // Vertical gradient along a ramp from t0 at the top to t1 at the bottom, dithered.
    void vgradient(int x, int y, int w, int h, const Ramp& r, double t0, double t1);
    void ellipse(double cx, double cy, double rx, double ry, std::uint8_t c);
    // Ellipse shaded like a lit ball along a ramp, light from the upper left.
    void ball(double cx, double cy, double rx, double ry, const Ramp& r, double lo = 0.15,
              double hi = 0.95);
    void polygon(const std::vector<Point>& pts, std::uint8_t c);
    void line(int x0, int y0, int x1, int y1, std::uint8_t c);
    void thickLine(double x0, double y0, double x1, double y1, double width, std::uint8_t c);
    // Rounded rectangle, filled.
    void roundRect(int x, int y, int w, int h, int radius, std::uint8_t c);
    // Key pixels inside the rectangle that touch a non-key pixel (4-neighbourhood, within the
    // rectangle) take colour c: a one-pixel outline around every shape.
    void outline(int x, int y, int w, int h, std::uint8_t c);
    void outline(std::uint8_t c) { outline(0, 0, w_, h_, c); }
    // Copies a rectangle of another canvas here; keyed copies skip the source's key pixels.
    void blit(const Canvas& src, int sx, int sy, int w, int h, int dx, int dy, bool keyed = false);
    // Copies a rectangle mirrored left to right.
    void blitMirrored(const Canvas& src, int sx, int sy, int w, int h, int dx, int dy);
    Canvas crop(int x, int y, int w, int h) const;

private:
    int w_ = 0, h_ = 0;
    std::vector<std::uint8_t> px_;
};

}  // namespace packgen
