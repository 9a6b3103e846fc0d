#include "verilog/tn_verilogtokenstreamfilter.h"

#include "verilog/tn_veriloglexer.h"
#include "verilog/tn_verilogtokentypes.h"

Tn_VerilogTokenStreamFilter::Tn_VerilogTokenStreamFilter(Tn_VerilogLexer& lexer) : lexer_(lexer) {}

Tn_VerilogTokenStreamFilter::~Tn_VerilogTokenStreamFilter() { unlink(); }

bool Tn_VerilogTokenStreamFilter::isHidden(const antlr::RefToken& t) const {
    return t && t->getType() == Tn_VerilogTokenTypes::METACOMMENT;
}

void Tn_VerilogTokenStreamFilter::readNext() {
    try {
        next_ = lexer_.nextToken();
    } catch (...) {
        next_ = antlr::nullToken;
        pending_ = std::current_exception();
    }
}

antlr::RefToken Tn_VerilogTokenStreamFilter::nextToken() {
    if (pending_) {
        std::exception_ptr e = pending_;
        pending_ = nullptr;
        std::rethrow_exception(e);
    }
    if (!started_) {
        started_ = true;
        readNext();
        antlr::RefToken previous;
        while (isHidden(next_)) {
            if (previous) {
                linkable(previous)->setHiddenAfter(next_);
                linkable(next_)->setHiddenBefore(previous);
                backLinked_.push_back(next_);
            } else {
                firstHidden_ = next_;
            }
            previous = lastHidden_ = next_;
            readNext();
        }
    } else if (!next_) {
        // After a scanner error: the lexer's stream has ended.
        readNext();
    }
    if (pending_) return nextToken();
    antlr::RefToken visible = next_;
    if (visible->getType() == Tn_VerilogTokenTypes::EOF_) return visible;
    linkable(visible)->setHiddenBefore(lastHidden_);
    lastHidden_ = antlr::nullToken;
    readNext();
    antlr::RefToken previous = visible;
    while (isHidden(next_)) {
        linkable(previous)->setHiddenAfter(next_);
        if (previous != visible) {
            linkable(next_)->setHiddenBefore(previous);
            backLinked_.push_back(next_);
        }
        previous = lastHidden_ = next_;
        readNext();
    }
    return visible;
}

void Tn_VerilogTokenStreamFilter::unlink() {
    for (antlr::RefToken& t : backLinked_) linkable(t)->setHiddenBefore(antlr::nullToken);
    backLinked_.clear();
}

void Tn_VerilogTokenStreamFilter::reset() {
    unlink();
    next_ = lastHidden_ = firstHidden_ = antlr::nullToken;
    pending_ = nullptr;
    started_ = false;
}
