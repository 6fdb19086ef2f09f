#pragma once

#include <benchmark/benchmark.h>

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <ostream>
#include <span>
#include <string>
#include <vector>

// What is measured, and what becomes of it: every function stands in one row beside what it is compared with, so that both
// run in one process and their ratio is formed from one run.

namespace benchmarks
{

using Work = std::function<void(benchmark::State&)>;

/// Another library's function that does the same work on the same data.
struct Peer
{
	std::string mLibrary;
	Work mWork;           ///< none where the library was not there when this was built: the row is left out
	double mWanted = 0;   ///< how many times as fast ours has to be; 0 where no number was set
};

/// Adds a row. Works that treat several items in one iteration say how many through State::SetItemsProcessed.
void Compare(std::string inArea, std::string inWhat, Work inOurs, std::vector<Peer> inPeers = {});

/// Adds a function whose cost is shown for growing inputs; inMakeWork makes the work for each size and counts items.
void Grow(std::string inWhat, std::span<const std::size_t> inSizes, const std::function<Work(std::size_t)>& inMakeWork);

/// One iteration is inConvert of all inputs, which inMakeInputs makes.
template <class MakeInputs, class Convert>
Work ForEach(MakeInputs inMakeInputs, Convert inConvert)
{
	return [inMakeInputs, inConvert](benchmark::State& ioState)
	{
		const auto inputs = inMakeInputs();
		Convert convert = inConvert;
		for (auto _ : ioState)
			for (const auto& input : inputs)
				benchmark::DoNotOptimize(convert(input));
		ioState.SetItemsProcessed(ioState.iterations() * static_cast<std::int64_t>(inputs.size()));
	};
}

/// One iteration is one call of inCall.
template <class Call>
Work Repeat(Call inCall)
{
	return [inCall](benchmark::State& ioState)
	{
		Call call = inCall;
		for (auto _ : ioState)
			benchmark::DoNotOptimize(call());
	};
}

/// Collects the time of one item of each work.
class Collector : public benchmark::ConsoleReporter
{
public:
	void ReportRuns(const std::vector<Run>& inRuns) override;

	/// The median of the repetitions in nanoseconds; 0 for what was not run.
	double Median(const std::string& inName) const;

private:
	std::map<std::string, std::vector<double>> mNanoseconds;
};

/// The rows that were run, as tables to read and as data.
void WriteTables(std::ostream& outStream, const Collector& inCollector);
void WriteJson(std::ostream& outStream, const Collector& inCollector);

}   // namespace benchmarks
