#include "output_buffer.h"

#include <cstddef>

namespace adtime {
namespace {

constexpr std::size_t kFlushBytes = std::size_t{1} << 18;

}  // namespace

OutputBuffer::OutputBuffer(std::FILE* out) : out_(out) {
  pending_.reserve(kFlushBytes + 4096);
}

void OutputBuffer::LineDone() {
  pending_.push_back('\n');
  if (pending_.size() >= kFlushBytes) {
    if (std::fwrite(pending_.data(), 1, pending_.size(), out_) != pending_.size()) {
      failed_ = true;
    }
    pending_.clear();
  }
}

bool OutputBuffer::Flush() {
  if (!pending_.empty() &&
      std::fwrite(pending_.data(), 1, pending_.size(), out_) != pending_.size()) {
    failed_ = true;
  }
  pending_.clear();
  if (std::fflush(out_) != 0) failed_ = true;
  return !failed_;
}

}  // namespace adtime
