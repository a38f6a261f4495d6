#pragma once

#include <utility>
#include <vector>

#include "host/base/entity_drawing.h"
#include "host/display/draw_list.h"
#include "host/display/draw_traits.h"
#include "tz/gi/draw.h"

class TzDbDatabase;

// Lets a drawable draw itself and keeps what it drew.
//
//   DrawPass pass(database, DrawPass::Entities::whole);
//   pass.draw(jig.entity());
//   use(pass.list());
//
// Entities that are invisible or on a layer that is off are left out, whoever draws them. Blocks
// within blocks can stand for more than any memory holds, so a pass takes no more nested drawables
// than kMostNested and no more letters than kMostLetters.
namespace tzhost {

class DrawPass {
public:
    // Whether entities of the host show as what they are (but for the one that `draw` was given),
    // or as the strokes that they consist of.
    enum class Entities { whole, strokes };

    // `database` is what the drawing's context gives; it may be null.
    DrawPass(TzDbDatabase* database, Entities entities);
    DrawPass(DrawPass const&) = delete;
    DrawPass& operator=(DrawPass const&) = delete;

    static constexpr int kMostNested = 2'000'000;
    static constexpr int kMostLetters = 5'000'000;

    // Draws one drawable after those drawn so far: its attributes, then itself. Null draws
    // nothing.
    void draw(TzGiDrawable* drawable);
    [[nodiscard]] DrawList const& list() const { return list_; }
    // The list for good; the pass begins a new one.
    [[nodiscard]] DrawList takeList() { return std::exchange(list_, {}); }
    // Whether nothing was left out for its number.
    [[nodiscard]] bool isWhole() const { return nested_ <= kMostNested && !hasTooManyLetters(); }
    [[nodiscard]] bool hasTooManyLetters() const { return letters_ > kMostLetters; }

private:
    class Context : public TzGiContext {
    public:
        explicit Context(TzDbDatabase* database) : database_(database) {}
        [[nodiscard]] TzDbDatabase* database() const override { return database_; }

    private:
        TzDbDatabase* database_;
    };

    class Geometry : public TzGiGeometry {
    public:
        explicit Geometry(DrawPass& pass) : pass_(pass) {}
        bool polyline(int count,
                      TzGePoint3d const* points,
                      TzGeVector3d const* normal,
                      long long marker) override;
        bool polygon(int count, TzGePoint3d const* points) override;
        bool circle(TzGePoint3d const& center, double radius, TzGeVector3d const& normal) override;
        bool text(TzGePoint3d const& position,
                  TzGeVector3d const& normal,
                  TzGeVector3d const& direction,
                  wchar_t const* text,
                  int length,
                  bool raw,
                  TzGiTextStyle const& style) override;
        bool draw(TzGiDrawable* drawable) override;
        void pushModelTransform(TzGeMatrix3d const& matrix) override;
        void popModelTransform() override;

    private:
        DrawPass& pass_;
    };

    // What the world's and the viewport's drawing have in common: both lead back to the pass.
    template <class Base>
    class Draw : public Base, public EntityTaker {
    public:
        explicit Draw(DrawPass& pass) : pass_(pass) {}
        [[nodiscard]] TzGiGeometry& geometry() override { return pass_.geometry_; }
        [[nodiscard]] TzGiSubEntityTraits& subEntityTraits() override { return pass_.traits_; }
        [[nodiscard]] TzGiContext* context() override { return &pass_.context_; }
        [[nodiscard]] bool isDragging() const override {
            return pass_.entities_ == Entities::whole;
        }
        bool takeEntity(TzDbEntity const& entity,
                        wchar_t const* type,
                        TzGePoint3d const& position) override {
            return pass_.take(entity, type, position);
        }

    private:
        DrawPass& pass_;
    };

    void drawNested(TzGiDrawable& drawable);
    bool take(TzDbEntity const& entity, wchar_t const* type, TzGePoint3d const& position);
    void addLines(DrawnLines lines);
    // Brings a text from the innermost transform's coordinates to those of the world.
    void place(DrawnText& text) const;
    [[nodiscard]] TzGeMatrix3d const& transform() const;

    Entities entities_;
    Context context_;
    Geometry geometry_{*this};
    Draw<TzGiWorldDraw> world_{*this};
    Draw<TzGiViewportDraw> viewport_{*this};
    DrawTraits traits_;
    std::vector<TzGeMatrix3d> transforms_;  // each from its own coordinates to the world
    TzGiDrawable const* top_ = nullptr;     // what `draw` was given, while it draws
    int depth_ = 0;
    int nested_ = 0;   // drawables that others drew; kMostNested + 1 when there were more
    int letters_ = 0;  // of all texts; kMostLetters + 1 when there were more
    DrawList list_;
};

}  // namespace tzhost
