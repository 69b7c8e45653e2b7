#include "LibPq.h"

#include "LibPqName.h"

#include <QLibrary>

namespace kareport
{

namespace
{

/// Finds the functions of a library, and notes when one is missing.
class Finder
{
public:
    explicit Finder(QLibrary &library) : library_(library), areFound_(library.load()) {}

    template <typename Function>
    void find(Function &function, const char *name)
    {
        function = areFound_ ? reinterpret_cast<Function>(library_.resolve(name)) : nullptr;
        areFound_ = areFound_ && function != nullptr;
    }
    bool areFound() const { return areFound_; }

private:
    QLibrary &library_;
    bool areFound_;
};

LibPq load()
{
    QLibrary library;
    setLibPqName(library);
    Finder finder(library);
    LibPq pq;
    finder.find(pq.clear, "PQclear");
    finder.find(pq.conninfo, "PQconninfo");
    finder.find(pq.conninfoFree, "PQconninfoFree");
    finder.find(pq.conninfoParse, "PQconninfoParse");
    finder.find(pq.connectPoll, "PQconnectPoll");
    finder.find(pq.connectStartParams, "PQconnectStartParams");
    finder.find(pq.connectionNeedsPassword, "PQconnectionNeedsPassword");
    finder.find(pq.consumeInput, "PQconsumeInput");
    finder.find(pq.cancel, "PQcancel");
    finder.find(pq.errorMessage, "PQerrorMessage");
    finder.find(pq.finish, "PQfinish");
    finder.find(pq.flush, "PQflush");
    finder.find(pq.fname, "PQfname");
    finder.find(pq.freeCancel, "PQfreeCancel");
    finder.find(pq.freemem, "PQfreemem");
    finder.find(pq.ftype, "PQftype");
    finder.find(pq.getCancel, "PQgetCancel");
    finder.find(pq.getResult, "PQgetResult");
    finder.find(pq.getisnull, "PQgetisnull");
    finder.find(pq.getlength, "PQgetlength");
    finder.find(pq.getvalue, "PQgetvalue");
    finder.find(pq.isBusy, "PQisBusy");
    finder.find(pq.nfields, "PQnfields");
    finder.find(pq.nparams, "PQnparams");
    finder.find(pq.ntuples, "PQntuples");
    finder.find(pq.resultErrorField, "PQresultErrorField");
    finder.find(pq.resultErrorMessage, "PQresultErrorMessage");
    finder.find(pq.resultStatus, "PQresultStatus");
    finder.find(pq.sendDescribePrepared, "PQsendDescribePrepared");
    finder.find(pq.sendPrepare, "PQsendPrepare");
    finder.find(pq.sendQuery, "PQsendQuery");
    finder.find(pq.sendQueryPrepared, "PQsendQueryPrepared");
    finder.find(pq.setErrorVerbosity, "PQsetErrorVerbosity");
    finder.find(pq.setNoticeProcessor, "PQsetNoticeProcessor");
    finder.find(pq.setnonblocking, "PQsetnonblocking");
    finder.find(pq.setSingleRowMode, "PQsetSingleRowMode");
    finder.find(pq.socket, "PQsocket");
    finder.find(pq.status, "PQstatus");
    finder.find(pq.transactionStatus, "PQtransactionStatus");
    pq.isLoaded = finder.areFound();
    return pq;
}

} // namespace

const LibPq &libPq()
{
    static const LibPq loaded = load();
    return loaded;
}

} // namespace kareport
