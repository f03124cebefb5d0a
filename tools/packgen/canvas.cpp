#include "tools/packgen/canvas.h"

#include <algorithm>
#include <cmath>

namespace packgen {

Canvas::Canvas(int w, int h, std::uint8_t fill) : w_(w), h_(h), px_(std::size_t(w) * h, fill) {}

void Canvas::blend(int x, int y, Rgb c, double a, Rgb overKey) {
    if (!inside(x, y) || a <= 0.0) {
        return;
    }
    std::uint8_t cur = get(x, y);
    Rgb below = cur == kKey ? overKey : Palette()[cur];
    set(x, y, Nearest(Mix(below, c, std::min(a, 1.0))));
}

void Canvas::fill(std::uint8_t c) {
    std::fill(px_.begin(), px_.end(), c);
}

void Canvas::rect(int x, int y, int w, int h, std::uint8_t c) {
    for (int j = y; j < y + h; ++j) {
        for (int i = x; i < x + w; ++i) {
            set(i, j, c);
        }
    }
}

void Canvas::frame(int x, int y, int w, int h, std::uint8_t c) {
    rect(x, y, w, 1, c);
    rect(x, y + h - 1, w, 1, c);
    rect(x, y, 1, h, c);
    rect(x + w - 1, y, 1, h, c);
}

void Canvas::paint(int x, int y, int w, int h, const std::function<std::uint8_t(int, int)>& shade) {
    for (int j = std::max(y, 0); j < std::min(y + h, h_); ++j) {
        for (int i = std::max(x, 0); i < std::min(x + w, w_); ++i) {
            set(i, j, shade(i, j));
        }
    }
}

void Canvas::vgradient(int x, int y, int w, int h, const Ramp& r, double t0, double t1) {
    paint(x, y, w, h, [&](int i, int j) {
        double f = h > 1 ? double(j - y) / (h - 1) : 0.0;
        return r.dither(t0 + (t1 - t0) * f, i, j);
    });
}

void Canvas::ellipse(double cx, double cy, double rx, double ry, std::uint8_t c) {
    for (int j = int(std::floor(cy - ry)); j <= int(std::ceil(cy + ry)); ++j) {
        for (int i = int(std::floor(cx - rx)); i <= int(std::ceil(cx + rx)); ++i) {
            double dx = (i + 0.5 - cx) / rx, dy = (j + 0.5 - cy) / ry;
            if (dx * dx + dy * dy <= 1.0) {
                set(i, j, c);
            }
        }
    }
}

void Canvas::ball(double cx, double cy, double rx, double ry, const Ramp& r, double lo, double hi) {
    for (int j = int(std::floor(cy - ry)); j <= int(std::ceil(cy + ry)); ++j) {
        for (int i = int(std::floor(cx - rx)); i <= int(std::ceil(cx + rx)); ++i) {
            double dx = (i + 0.5 - cx) / rx, dy = (j + 0.5 - cy) / ry;
            double d2 = dx * dx + dy * dy;
            if (d2 <= 1.0) {
                double nz = std::sqrt(1.0 - d2);
                double light = std::clamp(0.35 * -dx + 0.5 * -dy + 0.75 * nz, 0.0, 1.0);
                set(i, j, r.dither(lo + (hi - lo) * light, i, j));
            }
        }
    }
}

void Canvas::polygon(const std::vector<Point>& pts, std::uint8_t c) {
    if (pts.size() < 3) {
        return;
    }
    double ymin = pts[0].y, ymax = pts[0].y;
    for (const Point& p : pts) {
        ymin = std::min(ymin, p.y);
        ymax = std::max(ymax, p.y);
    }
    for (int j = int(std::floor(ymin)); j <= int(std::ceil(ymax)); ++j) {
        double yc = j + 0.5;
        std::vector<double> xs;
        for (std::size_t k = 0; k < pts.size(); ++k) {
            const Point& a = pts[k];
            const Point& b = pts[(k + 1) % pts.size()];
            if ((a.y <= yc && b.y > yc) || (b.y <= yc && a.y > yc)) {
                xs.push_back(a.x + (yc - a.y) / (b.y - a.y) * (b.x - a.x));
            }
        }
        std::sort(xs.begin(), xs.end());
        for (std::size_t k = 0; k + 1 < xs.size(); k += 2) {
            for (int i = int(std::ceil(xs[k] - 0.5)); i <= int(std::floor(xs[k + 1] - 0.5)); ++i) {
                set(i, j, c);
            }
        }
    }
}

void Canvas::line(int x0, int y0, int x1, int y1, std::uint8_t c) {
    int dx = std::abs(x1 - x0), sx = x0 < x1 ? 1 : -1;
    int dy = -std::abs(y1 - y0), sy = y0 < y1 ? 1 : -1;
    int err = dx + dy;
    for (;;) {
        set(x0, y0, c);
        if (x0 == x1 && y0 == y1) {
            break;
        }
        int e2 = 2 * err;
        if (e2 >= dy) {
            err += dy;
            x0 += sx;
        }
        if (e2 <= dx) {
            err += dx;
            y0 += sy;
        }
    }
}

void Canvas::thickLine(double x0, double y0, double x1, double y1, double width, std::uint8_t c) {
    double len = std::hypot(x1 - x0, y1 - y0);
    if (len < 1e-6) {
        ellipse(x0, y0, width / 2, width / 2, c);
        return;
    }
    double nx = -(y1 - y0) / len * width / 2, ny = (x1 - x0) / len * width / 2;
    polygon({{x0 + nx, y0 + ny}, {x1 + nx, y1 + ny}, {x1 - nx, y1 - ny}, {x0 - nx, y0 - ny}}, c);
}

void Canvas::roundRect(int x, int y, int w, int h, int radius, std::uint8_t c) {
    for (int j = y; j < y + h; ++j) {
        for (int i = x; i < x + w; ++i) {
            int cx = std::clamp(i, x + radius, x + w - 1 - radius);
            int cy = std::clamp(j, y + radius, y + h - 1 - radius);
            double dx = i - cx, dy = j - cy;
            if (dx * dx + dy * dy <= (radius + 0.3) * (radius + 0.3)) {
                set(i, j, c);
            }
        }
    }
}

void Canvas::outline(int x, int y, int w, int h, std::uint8_t c) {
    std::vector<std::uint8_t> mark(std::size_t(w) * h, 0);
    auto solid = [&](int i, int j) {
        return i >= x && j >= y && i < x + w && j < y + h && get(i, j) != kKey;
    };
    for (int j = y; j < y + h; ++j) {
        for (int i = x; i < x + w; ++i) {
            if (get(i, j) == kKey &&
                (solid(i - 1, j) || solid(i + 1, j) || solid(i, j - 1) || solid(i, j + 1))) {
                mark[std::size_t(j - y) * w + (i - x)] = 1;
            }
        }
    }
    for (int j = y; j < y + h; ++j) {
        for (int i = x; i < x + w; ++i) {
            if (mark[std::size_t(j - y) * w + (i - x)]) {
                set(i, j, c);
            }
        }
    }
}

void Canvas::blit(const Canvas& src, int sx, int sy, int w, int h, int dx, int dy, bool keyed) {
    for (int j = 0; j < h; ++j) {
        for (int i = 0; i < w; ++i) {
            if (!src.inside(sx + i, sy + j)) {
                continue;
            }
            std::uint8_t c = src.get(sx + i, sy + j);
            if (!keyed || c != kKey) {
                set(dx + i, dy + j, c);
            }
        }
    }
}

void Canvas::blitMirrored(const Canvas& src, int sx, int sy, int w, int h, int dx, int dy) {
    for (int j = 0; j < h; ++j) {
        for (int i = 0; i < w; ++i) {
            set(dx + w - 1 - i, dy + j, src.get(sx + i, sy + j));
        }
    }
}

Canvas Canvas::crop(int x, int y, int w, int h) const {
    Canvas out(w, h);
    out.blit(*this, x, y, w, h, 0, 0);
    return out;
}

}  // namespace packgen
