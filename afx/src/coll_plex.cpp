// CPlex: the blocks that lists and maps carve their nodes from.
#include <afxplex_.h>

CPlex* PASCAL CPlex::Create(CPlex*& pHead, UINT_PTR nMax, UINT_PTR cbElement)
{
    if (nMax == 0 || cbElement == 0 || nMax > (((size_t)-1) - sizeof(CPlex)) / cbElement)
        AfxThrowMemoryException();
    CPlex* p = (CPlex*)malloc(sizeof(CPlex) + nMax * cbElement);
    if (p == NULL)
        AfxThrowMemoryException();
    p->pNext = pHead;
    p->pReserved = NULL;
    pHead = p;
    return p;
}

void CPlex::FreeDataChain()
{
    CPlex* p = this;
    while (p != NULL)
    {
        CPlex* pNext = p->pNext;
        free(p);
        p = pNext;
    }
}
