#include "bench/decay_data.h"

#include "document/kota0_ad_doc.h"
#include "document/records/decay.h"

#include <cmath>
#include <cstdio>
#include <memory>
#include <random>
#include <rapidjson/document.h>
#include <rapidjson/filereadstream.h>
#include <rapidjson/filewritestream.h>
#include <rapidjson/writer.h>
#include <stdexcept>
#include <string_view>

namespace bench {

namespace {

using OpenFile = std::unique_ptr<std::FILE, int (*)(std::FILE*)>;

OpenFile open(const std::string& path, const char* mode) {
    OpenFile file(std::fopen(path.c_str(), mode), std::fclose);
    if (!file)
        throw std::runtime_error("cannot open " + path);
    return file;
}

constexpr std::size_t streamBuffer = 1 << 16;

} // namespace

std::vector<PlainDecay> makeDecay(int count) {
    constexpr const char* rivers[] = {"MISSOURI", "PLATTE", "LITTLE SIOUX", "BOYER", "FLOYD"};
    std::mt19937 random(1970);
    std::uniform_int_distribution<std::size_t> river(0, std::size(rivers) - 1);
    std::uniform_int_distribution<int> component(1, 8);
    std::uniform_int_distribution<int> perDay(191, 920); // in 1/1000
    std::bernoulli_distribution typedPerHour(0.5);
    std::uniform_int_distribution<int> decimetre(0, 2'270'000);
    std::vector<PlainDecay> records;
    records.reserve(count);
    for (int i = 0; i < count; ++i) {
        // Half of the users type the base unit, the others a rate per day, which is converted.
        const double rate = perDay(random) / 1000.0;
        const double decay = typedPerHour(random) ? std::round(rate / 24 * 1e4) / 1e4 : rate / 24;
        records.push_back({component(random), decay, false, rivers[river(random)], decimetre(random) / 10.0});
    }
    return records;
}

void addDecay(CKota0_adDoc& document, const std::vector<PlainDecay>& records) {
    for (const PlainDecay& plain : records) {
        auto* record = new AD_Decay;
        record->componentNum = plain.componentNum;
        record->decayConst = plain.decayConst;
        record->isGlobal = plain.isGlobal;
        record->riverName = plain.riverName.c_str();
        record->chainage = plain.chainage;
        document.decayList.AddTail(record);
    }
}

void writeJson(const std::string& path, const std::vector<PlainDecay>& records, JsonForm form) {
    const OpenFile file = open(path, "wb");
    std::vector<char> buffer(streamBuffer);
    rapidjson::FileWriteStream stream(file.get(), buffer.data(), buffer.size());
    rapidjson::Writer writer(stream);
    const bool named = form == JsonForm::Objects;
    const auto key = [&](std::string_view name) {
        if (named)
            writer.Key(name.data(), static_cast<rapidjson::SizeType>(name.size()));
    };
    writer.StartArray();
    for (const PlainDecay& record : records) {
        named ? writer.StartObject() : writer.StartArray();
        key("component");
        writer.Int(record.componentNum);
        key("decay");
        writer.Double(record.decayConst);
        key("global");
        writer.Bool(record.isGlobal);
        key("river");
        writer.String(record.riverName.data(), static_cast<rapidjson::SizeType>(record.riverName.size()));
        key("chainage");
        writer.Double(record.chainage);
        named ? writer.EndObject() : writer.EndArray();
    }
    writer.EndArray();
    stream.Flush();
}

std::vector<PlainDecay> readJson(const std::string& path, JsonForm form) {
    const OpenFile file = open(path, "rb");
    std::vector<char> buffer(streamBuffer);
    rapidjson::FileReadStream stream(file.get(), buffer.data(), buffer.size());
    // Never freed: it goes with the process, as the other side's records do.
    auto& json = *new rapidjson::Document;
    json.ParseStream<rapidjson::kParseFullPrecisionFlag>(stream); // else the last bits differ
    if (json.HasParseError() || !json.IsArray())
        throw std::runtime_error("not the JSON that was written");
    std::vector<PlainDecay> records;
    records.reserve(json.Size());
    for (const auto& row : json.GetArray()) {
        if (form == JsonForm::Objects)
            records.push_back({row["component"].GetInt(), row["decay"].GetDouble(), row["global"].GetBool(),
                               row["river"].GetString(), row["chainage"].GetDouble()});
        else
            records.push_back({row[0].GetInt(), row[1].GetDouble(), row[2].GetBool(), row[3].GetString(),
                               row[4].GetDouble()});
    }
    return records;
}

} // namespace bench
