// Reads a stream of frames that arrives in pieces, one per message of the input.

#include "FuzzTarget.h"
#include "InputMessages.h"

#include "PortFrame.h"

namespace {

using namespace orvex;

// Takes all complete frames and encodes them again.
Bytes takeAll(FrameReader& reader)
{
    Bytes taken;
    while (const auto frame = reader.take()) {
        const Bytes bytes = encodedFrame(*frame);
        taken.insert(taken.end(), bytes.begin(), bytes.end());
    }
    return taken;
}

} // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    FrameReader pieceByPiece;
    Bytes stream;
    Bytes taken;
    fuzz::InputMessages pieces({data, size});
    while (const auto piece = pieces.next()) {
        stream.insert(stream.end(), piece->begin(), piece->end());
        pieceByPiece.append(*piece);
        const Bytes frames = takeAll(pieceByPiece);
        taken.insert(taken.end(), frames.begin(), frames.end());
    }
    fuzz::require(taken.size() <= stream.size() && std::equal(taken.begin(), taken.end(), stream.begin()),
        "frames are the stream's bytes");
    fuzz::require(pieceByPiece.isInsideFrame() == (taken.size() < stream.size()), "nothing is lost");

    FrameReader atOnce;
    atOnce.append(stream);
    fuzz::require(takeAll(atOnce) == taken, "the same frames however the stream is split");
    fuzz::require(atOnce.fault() == pieceByPiece.fault(), "the same fault however the stream is split");
    return 0;
}
