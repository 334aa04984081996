#pragma once

#include <memory>
#include <vector>

// The one way the system hands an element it holds to a container or parent element that
// takes it over, and takes over elements that an interface hands across as raw pointers.

namespace VizBridgeTarvex {

/// Gives `piece` to `take`, a call that takes it over, and lets go of it only once `take` has
/// returned: should `take` throw, `piece` still frees it. A null piece is given as null.
/// Returns the piece, now the taker's.
template <class Piece, class Take> Piece* handOver(std::unique_ptr<Piece> piece, Take&& take) {
    Piece* const raw = piece.get();
    take(raw);
    static_cast<void>(piece.release());
    return raw;
}

/// Takes over the pieces that an interface handed across in `pieces`, which is empty
/// afterwards; should that fail, the pieces are freed all the same.
template <class Piece> std::vector<std::unique_ptr<Piece>> adoptAll(std::vector<Piece*>& pieces) {
    std::vector<std::unique_ptr<Piece>> owned;
    try {
        owned.reserve(pieces.size());
    } catch (...) {
        for (Piece* const piece : pieces)
            std::unique_ptr<Piece> const freed(piece);
        pieces.clear();
        throw;
    }
    for (Piece* const piece : pieces)
        owned.emplace_back(piece);
    pieces.clear();
    return owned;
}

/// Hands every piece of `pieces`, in order, to `take`, which takes each over.
template <class Piece, class Take>
void handOverAll(std::vector<std::unique_ptr<Piece>>& pieces, Take&& take) {
    for (std::unique_ptr<Piece>& piece : pieces)
        handOver(std::move(piece), take);
    pieces.clear();
}

} // namespace VizBridgeTarvex
