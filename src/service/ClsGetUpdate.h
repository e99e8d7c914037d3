// ClsGetUpdate: the update service client. Builds the request strings, performs the HTTP calls,
// reads check answers and file versions. One instance lives for one check.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "common/ports.h"

namespace checker {

class ClsGetUpdate {
  public:
    // `baseAddress`: scheme and host of the update service, e.g. "http://127.0.0.1:8080".
    ClsGetUpdate(HttpPort& http, std::string baseAddress, FilesPort* files = nullptr);

    // Request strings (query text after the "?"). Errors carry the builder's name as source.
    std::string fnInputStringCheck(std::uint8_t bytProdID, const std::string& strProdSubId,
                                   const std::string& strMajorVersion,
                                   const std::string& strMinorVersion,
                                   const std::string& strCustCode,
                                   const std::string& strCDKey = "");
    std::string fnInputStringCheckNewLicence(std::uint8_t bytProdID,
                                             const std::string& strProdSubId,
                                             std::int32_t lngCustID,
                                             const std::string& strMajorVersion,
                                             const std::string& strMinorVersion);
    std::string fnInputStringDownLoad(std::uint8_t bytProdID, const std::string& strProdSubId,
                                      const std::string& strMajorVersion,
                                      const std::string& strMinorVersion,
                                      const std::string& strCustCode,
                                      const std::string& strRepoHead, const std::string& strCDKey);
    std::string fnInputStringDownLoadNewLicence(std::uint8_t vbytProdID,
                                                const std::string& vstrProdSubId,
                                                const std::string& vstrMajorVersion,
                                                const std::string& vstrMinorVersion,
                                                std::int32_t vlngCustID,
                                                const std::string& vstrRepoHead);

    // Service calls: GET base + path + strInputString; the answer body whatever the status.
    // Failures: CheckerError with the HTTP layer's number and description, source = operation name.
    std::string fnGetInfoCheckUpdate(const std::string& strInputString);
    std::string fnGetInfoCheckUpdateNewLicence(const std::string& strInputString);
    std::string fnGetInfoDownload(const std::string& strInputString);
    std::string fnGetInfoDownloadNewLicence(const std::string& strInputString);

    // Update flag (field 3). Errors 9 (fewer than four fields) and 13 (no truth value).
    bool prValidateCheckInfo(const std::string& strInfo);
    // Major "a.b" and minor (last part) of a file's version; error 9 below two parts.
    void prGetExeVersion(const std::string& strFile, std::string& strFileMajorVersion,
                         std::string& strFileMinorVersion);

    // The last call's full address and the last successful answer.
    const std::string& lastAddress() const { return strAddress_; }
    const std::string& lastAnswer() const { return strAnswer_; }

  private:
    std::string call(std::string_view path, const std::string& strInputString,
                     std::string_view source);

    HttpPort& http_;
    std::string base_;
    FilesPort* files_;
    std::unique_ptr<HttpRequest> request_;
    std::string strAddress_;
    std::string strAnswer_;
};

} // namespace checker
