#include "support/RunTimeError.h"

#include <exception>
#include <new>
#include <system_error>

#include "support/RootDebug.h"
#include "support/cRegistry.h"

namespace zel {

RuntimeFailure currentFailure() {
    RuntimeFailure failure;
    try {
        throw;
    } catch (const RunTimeError& problem) {
        failure = {problem.number, problem.source, problem.what()};
    } catch (const RegistryError& problem) {
        failure.source = problem.source;
        failure.description = problem.what();
    } catch (const std::system_error& problem) {
        failure.number = problem.code().value();
        failure.description = problem.what();
    } catch (const std::bad_alloc&) {
        failure.description = "There is not enough memory for this.";
    } catch (const std::exception& problem) {
        failure.description = problem.what();
    } catch (...) {
        failure.description = "The reason is unknown.";
    }
    return failure;
}

}  // namespace zel
