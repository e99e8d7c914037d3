#include "service/ClsGetUpdate.h"

#include <initializer_list>
#include <new>
#include <string_view>
#include <utility>
#include <vector>

#include "common/constants.h"
#include "common/error.h"
#include "common/text.h"
#include "service/version_number.h"

namespace checker {

namespace {

using namespace service;

// Runs one builder or call under its own error trap: whatever fails is passed on with the same
// number and description and the operation's name as the source. Nothing partial escapes.
template <typename Body> std::string trapped(std::string_view source, Body&& body) {
    try {
        return body();
    } catch (const CheckerError& e) {
        throw e.withSource(std::string(source));
    } catch (const std::bad_alloc&) {
        throw CheckerError(kErrOutOfMemory, std::string(source), std::string(kTextOutOfMemory));
    }
}

// Keys and values in builder order; every blank of the whole string goes on the wire as "+".
std::string assemble(std::initializer_list<std::string_view> parts) {
    std::string out;
    std::size_t size = 0;
    for (auto p : parts)
        size += p.size();
    out.reserve(size);
    for (auto p : parts)
        out.append(p);
    return replaceAll(out, kBlank, kBlankOnWire);
}

std::string decimal(std::int32_t value) {
    return std::to_string(value);
}
std::string decimal(std::uint8_t value) {
    return std::to_string(static_cast<unsigned>(value));
}

} // namespace

ClsGetUpdate::ClsGetUpdate(HttpPort& http, std::string baseAddress, FilesPort* files)
    : http_(http), base_(std::move(baseAddress)), files_(files) {}

std::string ClsGetUpdate::fnInputStringCheck(std::uint8_t bytProdID,
                                             const std::string& strProdSubId,
                                             const std::string& strMajorVersion,
                                             const std::string& strMinorVersion,
                                             const std::string& strCustCode,
                                             const std::string& strCDKey) {
    return trapped(kSrcInputStringCheck, [&] {
        return assemble({kKeySelect, decimal(bytProdID), kKeyCDKey, strCDKey, kKeyMajorVersion,
                         strMajorVersion, kKeyCustCode, strCustCode, kKeyProdSubId, strProdSubId,
                         kKeyMinorVersion, strMinorVersion});
    });
}

std::string ClsGetUpdate::fnInputStringCheckNewLicence(std::uint8_t bytProdID,
                                                       const std::string& strProdSubId,
                                                       std::int32_t lngCustID,
                                                       const std::string& strMajorVersion,
                                                       const std::string& strMinorVersion) {
    return trapped(kSrcInputStringCheckNewLicence, [&] {
        return assemble({kKeySelect, decimal(bytProdID), kKeyCustID, decimal(lngCustID),
                         kKeyMajorVersion, strMajorVersion, kKeyProdSubId, strProdSubId,
                         kKeyMinorVersion, strMinorVersion});
    });
}

std::string ClsGetUpdate::fnInputStringDownLoad(
    std::uint8_t bytProdID, const std::string& strProdSubId, const std::string& strMajorVersion,
    const std::string& strMinorVersion, const std::string& strCustCode,
    const std::string& strRepoHead, const std::string& strCDKey) {
    return trapped(kSrcInputStringDownLoad, [&] {
        return assemble({kKeySelect, decimal(bytProdID), kKeySetupType, strProdSubId,
                         kKeyReportHead, strRepoHead, kKeyCDKey, strCDKey, kKeyMajorVersion,
                         strMajorVersion, kPairUserType, kKeyCustCode, strCustCode,
                         kKeyMinorVersionDownload, strMinorVersion});
    });
}

std::string ClsGetUpdate::fnInputStringDownLoadNewLicence(
    std::uint8_t vbytProdID, const std::string& vstrProdSubId, const std::string& vstrMajorVersion,
    const std::string& vstrMinorVersion, std::int32_t vlngCustID, const std::string& vstrRepoHead) {
    return trapped(kSrcInputStringDownLoadNewLicence, [&] {
        const std::string head = replaceAll(vstrRepoHead, kHeadAmpersand, kHeadAmpersandOnWire);
        return assemble({kKeySelect, decimal(vbytProdID), kKeySetupType, vstrProdSubId,
                         kKeyReportHead, head, kKeyMajorVersion, vstrMajorVersion, kKeyCustID,
                         decimal(vlngCustID), kKeyMinorVersionDownload, vstrMinorVersion});
    });
}

std::string ClsGetUpdate::fnGetInfoCheckUpdate(const std::string& strInputString) {
    return call(kPathCheck, strInputString, kSrcGetInfoCheckUpdate);
}

std::string ClsGetUpdate::fnGetInfoCheckUpdateNewLicence(const std::string& strInputString) {
    return call(kPathCheckNewLicence, strInputString, kSrcGetInfoCheckUpdateNewLicence);
}

std::string ClsGetUpdate::fnGetInfoDownload(const std::string& strInputString) {
    return call(kPathDownload, strInputString, kSrcGetInfoDownload);
}

std::string ClsGetUpdate::fnGetInfoDownloadNewLicence(const std::string& strInputString) {
    return call(kPathDownloadNewLicence, strInputString, kSrcGetInfoDownloadNewLicence);
}

std::string ClsGetUpdate::call(std::string_view path, const std::string& strInputString,
                               std::string_view source) {
    // The request object is made before the trap: a failure to create it keeps its own source.
    request_ = http_.create();
    return trapped(source, [&] {
        strAddress_.clear();
        strAddress_.reserve(base_.size() + path.size() + strInputString.size());
        strAddress_.append(base_).append(path).append(strInputString);
        request_->open(kMethodGet, strAddress_);
        request_->send();
        std::string answer = request_->responseText();
        strAnswer_ = answer;
        request_.reset();
        return answer;
    });
}

bool ClsGetUpdate::prValidateCheckInfo(const std::string& strInfo) {
    const std::string source(kSrcValidateCheckInfo);
    const std::vector<std::string> fields = splitFields(strInfo, kFieldSeparator);
    if (fields.size() <= kFieldUpdateFlag) throw subscriptError(source);
    const std::optional<bool> flag = fnTruthValue(fields[kFieldUpdateFlag]);
    if (!flag) throw typeMismatchError(source);
    return *flag;
}

void ClsGetUpdate::prGetExeVersion(const std::string& strFile, std::string& strFileMajorVersion,
                                   std::string& strFileMinorVersion) {
    const std::string source(kSrcGetExeVersion);
    if (!files_) throw CheckerError(kErrObjectNotSet, source, std::string(kTextObjectNotSet));
    const std::vector<std::string> parts =
        splitFields(files_->fileVersion(strFile), kVersionPartSeparator);
    if (parts.size() < 2) throw subscriptError(source);
    // Both texts are made before either out-parameter changes.
    std::string major = parts[0] + kVersionPartSeparator + parts[1];
    std::string minor = parts.back();
    strFileMajorVersion = std::move(major);
    strFileMinorVersion = std::move(minor);
}

} // namespace checker
