#include "host/drawing_file/json_stream.h"

#include <set>

#include "host/files/json_events.h"
#include "host/text/local_text.h"

namespace tzhost::drawingfile {
namespace {

// Where the parser stands outside the values that are handed over whole.
enum class Place { start, drawing, entities, blocks, block, blockEntities, end };

// Walks through the drawing itself, its streamed arrays and its blocks.
class StreamParser final : public JsonEvents {
public:
    StreamParser(JsonSource& source, JsonStore& store, DrawingSink& sink)
        : JsonEvents(source, store), store_(store), sink_(sink) {}

    [[nodiscard]] bool stopped() const { return stopped_; }

protected:
    bool take(JsonValue const& value) override;
    bool allow(JsonValue const& scalar) override;
    bool enter(JsonKind kind, bool& walked) override;
    bool leave() override;
    bool enterMember() override {
        return seen_[place_ == Place::block ? 1 : 0].emplace(name()).second || failTwice();
    }

private:
    bool handOn(JsonValue const& value);
    bool hand(bool accepted) {
        stopped_ = !accepted;
        return accepted;
    }
    bool isStreamed() const {
        return (place_ == Place::drawing && (name() == "entities" || name() == "blocks")) ||
               (place_ == Place::block && name() == "entities");
    }

    JsonStore& store_;
    DrawingSink& sink_;
    bool stopped_ = false;
    Place place_ = Place::start;
    std::set<std::string> seen_[2];  // members of the drawing and of the block so far
};

bool StreamParser::take(JsonValue const& value) {
    bool const goesOn = handOn(value);
    store_.clear();
    return goesOn;
}

bool StreamParser::handOn(JsonValue const& value) {
    switch (place_) {
    case Place::drawing: return hand(sink_.member(name(), value));
    case Place::block: return hand(sink_.blockMember(name(), value));
    case Place::entities:
    case Place::blockEntities: return hand(sink_.entity(value));
    case Place::blocks:
        return fail(localText("holds ") + nameOf(value.kind) + localText(", expected an object"));
    case Place::start:
    case Place::end: break;
    }
    return fail(localText("is ") + nameOf(value.kind) + localText(", expected an object"));
}

bool StreamParser::allow(JsonValue const& scalar) {
    return !isStreamed() ||
           fail(localText("is ") + nameOf(scalar.kind) + localText(", expected an array"));
}

bool StreamParser::enter(JsonKind kind, bool& walked) {
    bool const isArray = kind == JsonKind::array;
    walked = true;
    if (place_ == Place::start && !isArray) {
        place_ = Place::drawing;
    } else if (isStreamed()) {
        if (!isArray) return fail(localText("is an object, expected an array"));
        bool const inBlock = place_ == Place::block;
        place_ = inBlock              ? Place::blockEntities
                 : name() == "blocks" ? Place::blocks
                                      : Place::entities;
        if (!inBlock) sink_.beginArray(name());
    } else if (place_ == Place::blocks && !isArray) {
        place_ = Place::block;
        seen_[1].clear();
        return hand(sink_.beginBlock(line()));
    } else {
        walked = false;
    }
    return true;
}

bool StreamParser::leave() {
    switch (place_) {
    case Place::blockEntities: place_ = Place::block; break;
    case Place::block: place_ = Place::blocks; return hand(sink_.endBlock());
    case Place::entities:
    case Place::blocks: place_ = Place::drawing; break;
    default: place_ = Place::end; break;
    }
    return true;
}

}  // namespace

StreamResult readStream(std::FILE* file, DrawingSink& sink) {
    JsonSource source(file);
    JsonStore store;
    StreamParser parser(source, store, sink);
    (void)parser.readAll();  // the result says what became of it
    return {parser.stopped(), parser.failed(), parser.problem()};
}

}  // namespace tzhost::drawingfile
