#include "helpcompiler/Spool.h"

namespace tovimar::helpcompiler {
namespace {

constexpr std::size_t kInMemory = std::size_t{8} << 20;
constexpr std::size_t kPiece = std::size_t{1} << 20;

} // namespace

void Spool::Add(std::string_view bytes) {
    pending_ += bytes;
    size_ += bytes.size();
    if (pending_.size() > kInMemory && !folder_.empty())
        Empty();
}

void Spool::Empty() {
    if (!file_)
        file_.emplace(platform::NativeFile::ScratchIn(folder_.string()));
    file_->WriteAll(pending_);
    pending_.clear();
}

void Spool::CopyTo(const Write& write) const {
    if (file_) {
        file_->SeekTo(0);
        for (std::string piece = file_->ReadHere(kPiece); !piece.empty(); piece = file_->ReadHere(kPiece))
            write(piece);
    }
    write(pending_);
}

} // namespace tovimar::helpcompiler
