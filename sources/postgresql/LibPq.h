#pragma once

#include <libpq-fe.h>

namespace kareport
{

/// The functions of libpq, which is loaded when the first connection is made: most jobs need none, and it would take longer to
/// load than their report to make. Each has its name there without "PQ".
struct LibPq
{
    decltype(&::PQclear) clear = nullptr;
    decltype(&::PQconninfo) conninfo = nullptr;
    decltype(&::PQconninfoFree) conninfoFree = nullptr;
    decltype(&::PQconninfoParse) conninfoParse = nullptr;
    decltype(&::PQconnectPoll) connectPoll = nullptr;
    decltype(&::PQconnectStartParams) connectStartParams = nullptr;
    decltype(&::PQconnectionNeedsPassword) connectionNeedsPassword = nullptr;
    decltype(&::PQconsumeInput) consumeInput = nullptr;
    decltype(&::PQcancel) cancel = nullptr;
    decltype(&::PQerrorMessage) errorMessage = nullptr;
    decltype(&::PQfinish) finish = nullptr;
    decltype(&::PQflush) flush = nullptr;
    decltype(&::PQfname) fname = nullptr;
    decltype(&::PQfreeCancel) freeCancel = nullptr;
    decltype(&::PQfreemem) freemem = nullptr;
    decltype(&::PQftype) ftype = nullptr;
    decltype(&::PQgetCancel) getCancel = nullptr;
    decltype(&::PQgetResult) getResult = nullptr;
    decltype(&::PQgetisnull) getisnull = nullptr;
    decltype(&::PQgetlength) getlength = nullptr;
    decltype(&::PQgetvalue) getvalue = nullptr;
    decltype(&::PQisBusy) isBusy = nullptr;
    decltype(&::PQnfields) nfields = nullptr;
    decltype(&::PQnparams) nparams = nullptr;
    decltype(&::PQntuples) ntuples = nullptr;
    decltype(&::PQresultErrorField) resultErrorField = nullptr;
    decltype(&::PQresultErrorMessage) resultErrorMessage = nullptr;
    decltype(&::PQresultStatus) resultStatus = nullptr;
    decltype(&::PQsendDescribePrepared) sendDescribePrepared = nullptr;
    decltype(&::PQsendPrepare) sendPrepare = nullptr;
    decltype(&::PQsendQuery) sendQuery = nullptr;
    decltype(&::PQsendQueryPrepared) sendQueryPrepared = nullptr;
    decltype(&::PQsetErrorVerbosity) setErrorVerbosity = nullptr;
    decltype(&::PQsetNoticeProcessor) setNoticeProcessor = nullptr;
    decltype(&::PQsetnonblocking) setnonblocking = nullptr;
    decltype(&::PQsetSingleRowMode) setSingleRowMode = nullptr;
    decltype(&::PQsocket) socket = nullptr;
    decltype(&::PQstatus) status = nullptr;
    decltype(&::PQtransactionStatus) transactionStatus = nullptr;

    bool isLoaded = false;
};

/// The library. Where it is not installed, `isLoaded` is false and no function may be called.
const LibPq &libPq();

} // namespace kareport
