// For the memory sanitizer: the one function of the C++ library that writes what the programs here
// read, and that is neither a template nor instrumented. It puts a node into a std::map or
// std::set.
#include <map>
#include <sanitizer/msan_interface.h>

extern "C" {

using Node = std::_Rb_tree_node_base;

void __real__ZSt29_Rb_tree_insert_and_rebalancebPSt18_Rb_tree_node_baseS0_RS_(bool left, Node *node,
                                                                              Node *parent,
                                                                              Node &header);

void __wrap__ZSt29_Rb_tree_insert_and_rebalancebPSt18_Rb_tree_node_baseS0_RS_(bool left, Node *node,
                                                                              Node *parent,
                                                                              Node &header)
{
    __real__ZSt29_Rb_tree_insert_and_rebalancebPSt18_Rb_tree_node_baseS0_RS_(left, node, parent,
                                                                             header);
    // Links and colour. The others that it writes are those of nodes put in before.
    __msan_unpoison(node, sizeof *node);
}
}
