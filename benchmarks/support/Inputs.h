/// Inputs at random, one after the other, so that no contender lives on a repeated pattern.
///
///     CInputs<int> const numbers(randomNumbers());
///     numbers.next();                                   // one after the other, round and round
#ifndef QORN_BENCHMARKS_INPUTS_H
#define QORN_BENCHMARKS_INPUTS_H

#include <cstddef>
#include <memory>
#include <utility>
#include <vector>

namespace Benchmarks {

/// Copies share both the inputs and the place in them.
template <class TInput>
class CInputs {
  public:
    explicit CInputs(std::vector<TInput> inputs)
        : inputs_(std::make_shared<std::vector<TInput>>(std::move(inputs))) {}

    TInput const& next() const { return (*inputs_)[(*position_)++ % inputs_->size()]; }

    /// What `convert` makes of each.
    template <class TConvert>
    auto map(TConvert convert) const {
        std::vector<decltype(convert(inputs_->front()))> results;
        for (TInput const& input : *inputs_)
            results.push_back(convert(input));
        return CInputs<typename decltype(results)::value_type>(std::move(results));
    }

    bool operator==(CInputs const& other) const { return *inputs_ == *other.inputs_; }

  private:
    std::shared_ptr<std::vector<TInput>> inputs_;
    std::shared_ptr<std::size_t> position_ = std::make_shared<std::size_t>(0);
};

} // namespace Benchmarks

#endif
