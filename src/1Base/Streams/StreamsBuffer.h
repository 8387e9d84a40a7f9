/// A stream that reads a buffer of characters where it lies.
///
///     Strings::string const text = L"42 apples";
///     Streams::basic_isbufstream<wchar_t> in(text.data(), text.size());
///     int count = 0;
///     in >> count;   // count == 42
#ifndef QORN_1BASE_STREAMSBUFFER_H
#define QORN_1BASE_STREAMSBUFFER_H

#include <algorithm>
#include <istream>
#include <memory>
#include <streambuf>
#include <string>
#include <utility>

namespace Streams {

/// A stream buffer over characters that it does not own. It cannot be written to, and reading ends
/// at the end of the buffer. A null buffer counts as none.
template <class TChar, class TTraits = std::char_traits<TChar>>
class basic_isbufbuf : public std::basic_streambuf<TChar, TTraits> {
  public:
    using typename std::basic_streambuf<TChar, TTraits>::off_type;
    using typename std::basic_streambuf<TChar, TTraits>::pos_type;

    basic_isbufbuf() = default;
    basic_isbufbuf(basic_isbufbuf const&) = delete;
    basic_isbufbuf& operator=(basic_isbufbuf const&) = delete;
    ~basic_isbufbuf() override { close(); }

    /// Reads the `count` characters at `buffer` from their first on, instead of what was read
    /// before. They must outlive the last read.
    basic_isbufbuf& open(TChar* buffer, unsigned long count) {
        if (is_open())
            close();
        buffer_ = buffer;
        count_ = count;
        if (is_open())
            this->setg(buffer_, buffer_, buffer_ + count_);
        else
            this->setg(&spare_, &spare_, &spare_);
        return *this;
    }

    /// Forgets the buffer, which stays its owner's: there is nothing to read any more.
    basic_isbufbuf& close() {
        this->setg(nullptr, nullptr, nullptr);
        buffer_ = nullptr;
        count_ = 0;
        return *this;
    }

    /// True when there is a buffer, an empty one included.
    bool is_open() const { return buffer_ != nullptr; }

  protected:
    /// Moves within the buffer, clamped to its ends, and returns the number of characters from its
    /// start; -1 without a buffer. An offset from the end counts backward, unlike in the standard
    /// streams: 2 lands two characters before the end. Callers rely on it. The mode is ignored.
    pos_type seekoff(off_type offset, std::ios_base::seekdir direction,
                     std::ios_base::openmode) override {
        if (!is_open())
            return pos_type(off_type(-1));
        auto const count = static_cast<off_type>(count_);
        // No step is longer than the buffer, so that no sum overflows.
        off_type const step = std::clamp(offset, -count, count);
        off_type position = 0;
        switch (direction) {
        case std::ios_base::beg:
            position = step;
            break;
        case std::ios_base::cur:
            position = (this->gptr() - buffer_) + step;
            break;
        case std::ios_base::end:
            position = count - step;
            break;
        default:
            return pos_type(off_type(-1));
        }
        position = std::clamp(position, off_type(0), count);
        this->setg(buffer_, buffer_ + position, buffer_ + count_);
        return pos_type(position);
    }

    /// Moves to a position from the start, clamped like an offset.
    pos_type seekpos(pos_type position, std::ios_base::openmode mode) override {
        return seekoff(off_type(position), std::ios_base::beg, mode);
    }

  private:
    TChar* buffer_ = nullptr;
    unsigned long count_ = 0;
    /// The empty get area while no buffer is set.
    TChar spare_ = TChar();
};

/// Reads the `count` characters at `buffer`, which are not copied: they must outlive the stream.
template <class TChar, class TTraits = std::char_traits<TChar>>
class basic_isbufstream : public std::basic_istream<TChar, TTraits> {
  public:
    /// Stands on the first character.
    basic_isbufstream(TChar const* buffer, unsigned long count)
        : basic_isbufstream(std::make_unique<basic_isbufbuf<TChar, TTraits>>()) {
        // Nothing writes to the buffer.
        buffer_->open(const_cast<TChar*>(buffer), count);
    }

  private:
    // The standard base is given a finished buffer, so that the stream is initialised once.
    explicit basic_isbufstream(std::unique_ptr<basic_isbufbuf<TChar, TTraits>> buffer)
        : std::basic_istream<TChar, TTraits>(buffer.get()), buffer_(std::move(buffer)) {}

    std::unique_ptr<basic_isbufbuf<TChar, TTraits>> buffer_;
};

extern template class basic_isbufbuf<wchar_t>;
extern template class basic_isbufstream<wchar_t>;

} // namespace Streams

#endif
