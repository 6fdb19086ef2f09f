#include "Comparison.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cmath>
#include <iomanip>
#include <sstream>
#include <utility>

#if ZON_HAS_GSTREAMER
	#include <gst/gst.h>
#endif

extern "C"
{
#include <libavutil/avutil.h>
}

namespace benchmarks
{
namespace
{

constexpr const char* kOurs = "ours";

struct Row
{
	std::string mArea;
	std::string mWhat;
	std::vector<std::pair<std::string, double>> mPeers;   // library and wanted ratio

	std::string NameOf(const std::string& inLibrary) const { return mArea + "/" + mWhat + "/" + inLibrary; }
};

struct GrowthRow
{
	std::string mWhat;
	std::vector<std::size_t> mSizes;

	std::string NameOf(std::size_t inSize) const { return "Growth/" + mWhat + "/" + std::to_string(inSize); }
};

// Rows are added by the initialisers of other files.
std::vector<Row>& Rows()
{
	static std::vector<Row> sRows;
	return sRows;
}

std::vector<GrowthRow>& GrowthRows()
{
	static std::vector<GrowthRow> sRows;
	return sRows;
}

void Register(const std::string& inName, Work inWork)
{
	benchmark::RegisterBenchmark(
		inName.c_str(), [work = std::move(inWork)](benchmark::State& ioState) { work(ioState); });
}

// Two decimals below 10, one below 100, none above.
std::string Rounded(double inValue)
{
	std::ostringstream stream;
	const int digits = inValue >= 100 ? 0 : inValue >= 10 ? 1 : 2;
	stream << std::fixed << std::setprecision(digits) << inValue;
	return stream.str();
}

std::string Compiler()
{
#ifdef __clang__
	return "clang " __clang_version__;
#else
	return "g++ " __VERSION__;
#endif
}

std::string Processor()
{
	const benchmark::CPUInfo& info = benchmark::CPUInfo::Get();
	std::ostringstream stream;
	stream << info.num_cpus << " x " << Rounded(info.cycles_per_second / 1e9) << " GHz";
	return stream.str();
}

std::string Peers()
{
	const std::string libav = std::string("FFmpeg ") + av_version_info();
#if ZON_HAS_GSTREAMER
	return libav + ", " + gst_version_string();
#else
	return libav;
#endif
}

void WriteArea(std::ostream& outStream, const Collector& inCollector, const std::string& inArea)
{
	outStream << "\n## " << inArea << "\n\n| | ours | beside it | its time | times as fast | wanted |\n"
			  << "|---|---:|---|---:|---:|---:|\n";
	for (const Row& row : Rows())
	{
		const double ours = inCollector.Median(row.NameOf(kOurs));
		if (row.mArea != inArea || ours == 0)
			continue;
		if (row.mPeers.empty())
			outStream << "| " << row.mWhat << " | " << Rounded(ours) << " ns | | | | |\n";
		for (const auto& [library, wanted] : row.mPeers)
		{
			const double peer = inCollector.Median(row.NameOf(library));
			outStream << "| " << row.mWhat << " | " << Rounded(ours) << " ns | " << library << " | " << Rounded(peer)
					  << " ns | " << Rounded(peer / ours) << " | " << (wanted != 0 ? Rounded(wanted) : "") << " |\n";
		}
	}
}

void WriteGrowth(std::ostream& outStream, const Collector& inCollector)
{
	outStream << "\n## Growth\n\nThe time of one item, for inputs of growing size.\n";
	for (const GrowthRow& row : GrowthRows())
	{
		outStream << "\n| " << row.mWhat << " |";
		for (const std::size_t size : row.mSizes)
			outStream << ' ' << size << " |";
		outStream << "\n|---|";
		for (std::size_t i = 0; i < row.mSizes.size(); ++i)
			outStream << "---:|";
		outStream << "\n| ns an item |";
		for (const std::size_t size : row.mSizes)
			outStream << ' ' << Rounded(inCollector.Median(row.NameOf(size))) << " |";
		outStream << '\n';
	}
}

}   // namespace

void Compare(std::string inArea, std::string inWhat, Work inOurs, std::vector<Peer> inPeers)
{
	Row row{std::move(inArea), std::move(inWhat), {}};
	Register(row.NameOf(kOurs), std::move(inOurs));
	for (Peer& peer : inPeers)
	{
		if (!peer.mWork)
			continue;
		Register(row.NameOf(peer.mLibrary), std::move(peer.mWork));
		row.mPeers.emplace_back(peer.mLibrary, peer.mWanted);
	}
	Rows().push_back(std::move(row));
}

void Grow(std::string inWhat, std::span<const std::size_t> inSizes, const std::function<Work(std::size_t)>& inMakeWork)
{
	GrowthRow row{std::move(inWhat), {inSizes.begin(), inSizes.end()}};
	for (const std::size_t size : row.mSizes)
		Register(row.NameOf(size), inMakeWork(size));
	GrowthRows().push_back(std::move(row));
}

void Collector::ReportRuns(const std::vector<Run>& inRuns)
{
	ConsoleReporter::ReportRuns(inRuns);
	for (const Run& run : inRuns)
	{
		if (run.run_type != Run::RT_Iteration || run.error_occurred)
			continue;
		const auto items = run.counters.find("items_per_second");
		mNanoseconds[run.run_name.function_name].push_back(
			items != run.counters.end() ? 1e9 / items->second : run.GetAdjustedCPUTime());
	}
}

double Collector::Median(const std::string& inName) const
{
	const auto found = mNanoseconds.find(inName);
	if (found == mNanoseconds.end())
		return 0;
	std::vector<double> times = found->second;
	const auto middle = times.begin() + static_cast<std::ptrdiff_t>(times.size() / 2);
	std::ranges::nth_element(times, middle);
	return *middle;
}

void WriteTables(std::ostream& outStream, const Collector& inCollector)
{
	outStream
		<< "# Measured speed {#measured_speed}\n\nWritten by `scripts/benchmark`; see [Speed](@ref speed) for what it "
		   "means. CPU time a call, medians. "
		<< Processor() << ", " << Compiler() << "; beside " << Peers() << ".\n";
	std::string area;
	for (const Row& row : Rows())
		if (row.mArea != std::exchange(area, row.mArea))
			WriteArea(outStream, inCollector, row.mArea);
	WriteGrowth(outStream, inCollector);
}

void WriteJson(std::ostream& outStream, const Collector& inCollector)
{
	nlohmann::ordered_json rows = nlohmann::ordered_json::array();
	for (const Row& row : Rows())
	{
		const double ours = inCollector.Median(row.NameOf(kOurs));
		nlohmann::ordered_json peers = nlohmann::ordered_json::array();
		for (const auto& [library, wanted] : row.mPeers)
		{
			const double peer = inCollector.Median(row.NameOf(library));
			peers.push_back({{"library", library}, {"ns", peer}, {"ratio", ours != 0 ? peer / ours : 0}});
			if (wanted != 0)
				peers.back()["wanted"] = wanted;
		}
		if (ours != 0)
			rows.push_back({{"area", row.mArea}, {"what", row.mWhat}, {"ns", ours}, {"peers", std::move(peers)}});
	}
	nlohmann::ordered_json growth = nlohmann::ordered_json::array();
	for (const GrowthRow& row : GrowthRows())
	{
		nlohmann::ordered_json points = nlohmann::ordered_json::array();
		for (const std::size_t size : row.mSizes)
			points.push_back({{"size", size}, {"ns_per_item", inCollector.Median(row.NameOf(size))}});
		growth.push_back({{"what", row.mWhat}, {"points", std::move(points)}});
	}
	const nlohmann::ordered_json document{{"processor", Processor()}, {"compiler", Compiler()}, {"peers", Peers()},
		{"comparisons", std::move(rows)}, {"growth", std::move(growth)}};
	outStream << document.dump(1, '\t') << '\n';
}

}   // namespace benchmarks
