#pragma once

#include <string>
#include <vector>

class CKota0_adDoc;

namespace bench {

// A decay record as a program without the document's classes would hold it.
struct PlainDecay {
    int componentNum;
    double decayConst;
    bool isGlobal;
    std::string riverName;
    double chainage;
};

// `count` decay records of several components along several rivers, the same for the same count.
std::vector<PlainDecay> makeDecay(int count);
void addDecay(CKota0_adDoc& document, const std::vector<PlainDecay>& records);

// How a record stands in JSON: an object with named members, or an array in the order of the record's
// parameters on file.
enum class JsonForm { Objects, Arrays };

void writeJson(const std::string& path, const std::vector<PlainDecay>& records, JsonForm form);
std::vector<PlainDecay> readJson(const std::string& path, JsonForm form);

} // namespace bench
