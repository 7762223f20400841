// The families of benchmarks. Names are "family/what/of_what"; figures.py reads them.
#pragma once

namespace bench {

/// heap: pairs of an allocation and a free, the measure of what is below.
void register_heap_benchmarks();
/// codec: decoding, destroying, encoding, reporting.
void register_codec_benchmarks();
/// stage: each stage of a composition by itself.
void register_stage_benchmarks();
/// compose: whole compositions, and the stack that they need.
void register_composition_benchmarks();
/// growth: decoding and composing with lists of growing length.
void register_growth_benchmarks();
/// store: look-ups in configurations of growing size.
void register_store_benchmarks();

}  // namespace bench
