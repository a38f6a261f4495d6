#include "host/drawing_file/drawing_file.h"

#include <cstdio>
#include <new>

#include "host/base/job.h"
#include "host/drawing_file/drawing_reader.h"
#include "host/drawing_file/drawing_writer.h"
#include "host/files/file_bytes.h"
#include "host/files/file_kind.h"
#include "host/files/safe_file.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace drawingfile {
namespace {

std::string messageOf(std::filesystem::path const& file, Problem const& problem) {
    std::string text = file.string() + ':' + std::to_string(problem.line) + ": ";
    text += problem.member.empty() ? localText("the drawing")
                                   : localText("member \"") + problem.member + '"';
    return text + (problem.member.empty() ? " " : ": ") + problem.what;
}

// Runs over the file; false when something is wrong, which `context` then holds.
bool runOver(std::FILE* file, DrawingReader& reader, ReadContext& context) {
    StreamResult const result = readStream(file, reader);
    if (result.failed) {
        context.complain(result.problem.line, result.problem.member, result.problem.what);
    }
    return !context.failed;
}

struct FileCloser {
    void operator()(std::FILE* file) const { (void)std::fclose(file); }  // only read from
};

}  // namespace
}  // namespace drawingfile

namespace {

DrawingRead readUnguarded(std::filesystem::path const& file) {
    using namespace drawingfile;
    DrawingRead result;
    if (faultStatus("readDrawing", Tzad::eFileError)) {
        result.error = file.string() + ": " + localText("cannot be read");
        return result;
    }
    std::unique_ptr<std::FILE, FileCloser> const stream(
        isFile(file.string()) ? std::fopen(file.c_str(), "rb") : nullptr);
    if (!stream) {
        result.error = file.string() + ": " + localText("cannot be read") + ": " + systemReason();
        return result;
    }
    auto drawing = Drawing::create();
    ReadContext context{*drawing, false, {}, {}};
    DrawingReader reader(context);
    bool good = runOver(stream.get(), reader, context);
    if (good && reader.needsSecondPass()) {
        std::rewind(stream.get());
        reader.startPass(Pass::entitiesOnly);
        good = runOver(stream.get(), reader, context);
    }
    if (good) reader.finish();
    for (std::string const& warning : context.warnings)
        result.warnings.push_back(file.string() + ':' + warning);
    result.isNewer = reader.isNewer();
    if (context.failed) {
        result.error = messageOf(file, context.problem);
        return result;
    }
    result.variables = reader.takeVariables();
    drawing->setFile(file);
    result.drawing = std::move(drawing);
    return result;
}

}  // namespace

// What was read so far is gone when memory runs short, so that there is enough for the message.
DrawingRead readDrawing(std::filesystem::path const& file) try {
    Job const job(localText(L"Opening"));
    return readUnguarded(file);
} catch (std::bad_alloc const&) {
    DrawingRead result;
    result.error =
        file.string() + ": " + localText("cannot be read") + ": " + localText("memory ran short");
    return result;
}

void setKeptVariables(Variables::Values const& values) {
    Variables& store = Variables::instance();
    store.resetKept(KeptIn::drawing);
    for (auto const& [name, value] : values)
        (void)store.setKept(name, value);  // checked when they were read
}

std::string
writeDrawing(Drawing& drawing, std::filesystem::path const& file, IfReadOnly ifReadOnly) try {
    using namespace drawingfile;
    if (faultStatus("writeDrawing", Tzad::eFileError))
        return file.string() + ": " + localText("cannot be written");
    SafeFile target(file, ifReadOnly);
    if (target.isOpen() && writeWhole(drawing, target) && target.commit()) return {};
    return file.string() + ": " + localText("cannot be written") + ": " + target.reason();
} catch (std::bad_alloc const&) {
    return file.string() + ": " + localText("cannot be written") + ": " +
           localText("memory ran short");
}

}  // namespace tzhost
