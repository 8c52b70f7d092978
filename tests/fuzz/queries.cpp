// Which native counts what another one answers, and the walk along all of them.
#include "queries.h"

#include "check.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <map>

namespace fuzz {

namespace {

// What a query answers with an index that is counted.
enum Answered {
    kAlways,
    kWhereSet, // null where the record has no such text
};

// A query, and the natives that count along each of its indexes: the first for the first index, the
// second, given the first index, for the second one, and so on.
struct Query {
    const char *data;
    std::array<const char *, 4> counts;
    Answered answered = kAlways;
};

constexpr const char *kLogicals = "qvomacp_GetPxLogicalCount";
constexpr const char *kPorts = "qvomacp_GetPxPortCount";
constexpr const char *kPhysicals = "qvomacp_GetPxPhysicalCount";
constexpr const char *kPhysicalPorts = "qvomacp_GetPxPhysicalPortCount";
constexpr const char *kNapDefs = "qvomacp_GetPxNapDefCount";
constexpr const char *kNapAuthInfos = "qvomacp_GetPxNapAuthInfoCount";
constexpr const char *kBootstraps = "qvomacp_GetPxBootstrapCount";
constexpr const char *kApplications = "qvomacp_GetPxApplicationCount";
constexpr const char *kAppAddrs = "qvomacp_GetPxAppAddrCount";
constexpr const char *kAppPorts = "qvomacp_GetPxAppPortCount";
constexpr const char *kAccesses = "qvomacp_GetPxCtxAccessCount";
constexpr const char *kBearers = "qvomacp_GetPxBearerCount";
constexpr const char *kProxyData = "qvomacp_GetProxyData";

constexpr Query kQueries[] = {
    {kProxyData, {kLogicals}},
    {"qvomacp_GetPxDomainData", {kLogicals, "qvomacp_GetPxDomainCount"}},
    {"qvomacp_GetPxAuthInfoData", {kLogicals, "qvomacp_GetPxAuthInfoCount"}},
    {"qvomacp_GetPxPortData", {kLogicals, kPorts}, kWhereSet},
    {"qvomacp_GetPxPortServiceData", {kLogicals, kPorts, "qvomacp_GetPxPortServiceCount"}},
    {"qvomacp_GetPxPhysicalData", {kLogicals, kPhysicals}},
    {"qvomacp_GetPxPhsicalDomainData", {kLogicals, kPhysicals, "qvomacp_GetPxPhysicalDomainCount"}},
    {"qvomacp_GetPxPhysicalNapIdData", {kLogicals, kPhysicals, "qvomacp_GetPxPhsicalNapIdCount"}},
    {"qvomacp_GetPxPhysicalPortData", {kLogicals, kPhysicals, kPhysicalPorts}, kWhereSet},
    {"qvomacp_GetPxPhysicalPortServiceData",
     {kLogicals, kPhysicals, kPhysicalPorts, "qvomacp_GetPxPhysicalPortServiceCount"}},
    {"qvomacp_GetPxNapDefData", {kNapDefs}},
    {"qvomacp_GetPxDnsAddrData", {kNapDefs, "qvomacp_GetPxDnsAddrCount"}},
    {"qvomacp_GetPxBearerData", {kNapDefs, kBearers}, kWhereSet},
    {"qvomacp_GetPxNapAuthInfoData", {kNapDefs, kNapAuthInfos}},
    {"qvomacp_GetPxAuthInfopAuthEntityData",
     {kNapDefs, kNapAuthInfos, "qvomacp_GetPxNapAuthEntityCount"}},
    {"qvomacp_GetPxValidityData", {kNapDefs, "qvomacp_GetPxNapValidityCount"}},
    {"qvomacp_GetBootstrapData", {kBootstraps}},
    {"qvomacp_GetPxProxyIdData", {kBootstraps, "qvomacp_GetPxProxyIdCount"}},
    {"qvomacp_GetPxNetworkData", {kBootstraps, "qvomacp_GetPxNetworkCount"}},
    {"qvomacp_GetPxClientIdentityData", {}, kWhereSet},
    {"qvomacp_GetPxVenderConfigData", {"qvomacp_GetPxVenderConfigCount"}},
    {"qvomacp_GetApplicationData", {kApplications}},
    {"qvomacp_GetPxToProxyData", {kApplications, "qvomacp_GetPxToProxyCount"}},
    {"qvomacp_GetPxNapIdData", {kApplications, "qvomacp_GetPxNapIdCount"}},
    {"qvomacp_GetPxToAddrData", {kApplications, "qvomacp_GetPxToAddrCount"}},
    {"qvomacp_GetPxAppAddrData", {kApplications, kAppAddrs}},
    {"qvomacp_GetPxAppPortData", {kApplications, kAppAddrs, kAppPorts}, kWhereSet},
    {"qvomacp_GetPxServiceData",
     {kApplications, kAppAddrs, kAppPorts, "qvomacp_GetPxServiceCount"}},
    {"qvomacp_GetPxAppAuthData", {kApplications, "qvomacp_GetPxAppAuthCount"}},
    {"qvomacp_GetPxResourceData", {kApplications, "qvomacp_GetPxResourceCount"}},
    {"qvomacp_GetPxRoamingData", {}, kWhereSet},
    {"qvomacp_GetPxRuleData", {kAccesses, "qvomacp_GetPxRuleCount"}},
    {"qvomacp_GetPxAppIdData", {kAccesses, "qvomacp_GetPxAppIdCount"}},
    {"qvomacp_GetPxPortNbrData", {kAccesses, "qvomacp_GetPxPortNbrCount"}},
    {"qvomacp_GetPxAccessDomainData", {kAccesses, "qvomacp_GetPxAccessDomainCount"}},
    {"qvomacp_GetPxAccessToNapIdData", {kAccesses, "qvomacp_GetPxAccessToNapIdCount"}},
    {"qvomacp_GetPxAccessToProxyData", {kAccesses, "qvomacp_GetPxAccessToProxyCount"}},
    {"qvomacp_GetPxWifiData", {"qvomacp_GetPxWifiCount"}},
    {"qvomacp_GetPxVoWifiData", {"qvomacp_GetPxVoWifiCount"}},
};

// The services of a proxy's port have names for this many indexes only.
constexpr jint kNamedServices = 10;

bool isServiceName(const Query &query)
{
    return std::string_view(query.data).find("PortServiceData") != std::string_view::npos;
}

class Asking {
public:
    explicit Asking(fakevm::Vm *machine) : vm(machine)
    {
        for (const fakevm::Native &native : vm->natives()) {
            natives[native.name] = &native;
        }
    }

    std::string all()
    {
        for (const Query &query : kQueries) {
            log += query.data;
            if (query.counts[0]) {
                level(query, 0);
            } else {
                note(ask(query.data));
            }
            log += '\n';
        }
        return std::move(log);
    }

    void each()
    {
        for (const auto &[name, native] : natives) {
            if (name.find("qvomacp_Get") == 0 && name.find("Parser") == name.npos) {
                indexes.assign(native->indexes(), 1);
                (void)ask(name);
            }
        }
    }

private:
    fakevm::Answer ask(std::string_view name) { return vm->call(*natives.at(name), indexes); }

    jint count(std::string_view name)
    {
        const jint answer = ask(name).number;
        check(answer >= 0, "no count is negative", name, ' ', answer);
        return answer;
    }

    // The indexes from -1 to one past the end.
    static std::vector<jint> indexesUpTo(jint end)
    {
        std::vector<jint> all;
        const jint step = end > 40 ? end / 16 : 1;
        for (jint i = -1; i <= end + 1;
             i += i < 8 || i > end - 3 ? 1 : std::min(step, end - 2 - i)) {
            all.push_back(i);
        }
        return all;
    }

    void level(const Query &query, size_t depth)
    {
        const bool last = depth + 1 == query.counts.size() || !query.counts[depth + 1];
        const jint end = count(query.counts[depth]);
        log += ' ' + std::to_string(end) + ':';
        std::vector<jint> asked = indexesUpTo(end);
        if (depth == 0) {
            asked.insert(asked.end(), {INT32_MIN, INT32_MAX});
        }
        for (jint i : asked) {
            indexes.push_back(i);
            const bool counted = i >= 1 && i <= end;
            if (!counted) {
                nothing(query, depth, last);
            } else if (last) {
                something(query, i);
            } else {
                level(query, depth + 1);
            }
            indexes.pop_back();
        }
    }

    void something(const Query &query, jint last)
    {
        const fakevm::Answer answer = ask(query.data);
        const bool mayBeNull =
            query.answered == kWhereSet || (isServiceName(query) && last > kNamedServices);
        check(answer.text || answer.array || mayBeNull, "every index that is counted is answered",
              query.data, ' ', last);
        note(answer);
    }

    // Behind an index that is not counted there is nothing.
    void nothing(const Query &query, size_t depth, bool last)
    {
        const size_t given = indexes.size();
        if (!last) {
            const char *below = query.counts[depth + 1];
            const jint found = count(below);
            // An index below 1 counts the bearers of the first access point.
            check(found == 0 || (below == kBearers && indexes.back() < 1),
                  "no count is below what is not there", below, ' ', found);
        }
        while (indexes.size() < native(query.data)->indexes()) {
            indexes.push_back(1);
        }
        const fakevm::Answer answer = ask(query.data);
        indexes.resize(given);
        check(!answer.text, "no text behind the last index", query.data, ' ', indexes.back());
        const bool blank = answer.array && query.data == kProxyData &&
                           std::all_of(answer.array->begin(), answer.array->end(),
                                       [](const fakevm::Text &text) { return text == ""; });
        check(!answer.array || blank, "no array behind the last index", query.data);
    }

    const fakevm::Native *native(std::string_view name) { return natives.at(name); }

    void note(const fakevm::Answer &answer)
    {
        note(answer.text);
        if (answer.array) {
            log += '{';
            for (const fakevm::Text &text : *answer.array) {
                note(text);
            }
            log += '}';
        }
    }

    void note(const fakevm::Text &text)
    {
        log += text ? '"' : '-';
        log += text.value_or("");
    }

    fakevm::Vm *vm;
    std::map<std::string_view, const fakevm::Native *> natives;
    std::vector<jint> indexes;
    std::string log;
};

} // namespace

std::string askAll(fakevm::Vm *vm)
{
    return Asking(vm).all();
}

void askEach(fakevm::Vm *vm)
{
    Asking(vm).each();
}

} // namespace fuzz
