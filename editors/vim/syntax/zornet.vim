" Models of zornet.
" SPDX-License-Identifier: MIT
if exists('b:current_syntax')
  finish
endif

syntax match zornetDelimiter /[][:;,(){}|]/
syntax match zornetOperator /\.\.\|=/
syntax match zornetName /\<\h\w*\>/
syntax match zornetConstraint /\<\h\w*\ze\_s*(/
syntax keyword zornetItem var array constraint output include
syntax keyword zornetType set of string int bool lines
syntax keyword zornetTruth true false
syntax match zornetNumber /-\?\<\d\+\>/
syntax match zornetText /"\(\\.\|[^"\\]\)*"/
syntax match zornetComment /%.*/

highlight default link zornetDelimiter Delimiter
highlight default link zornetOperator Operator
highlight default link zornetName Identifier
highlight default link zornetConstraint Function
highlight default link zornetItem Statement
highlight default link zornetType Type
highlight default link zornetTruth Boolean
highlight default link zornetNumber Number
highlight default link zornetText String
highlight default link zornetComment Comment

let b:current_syntax = 'zornet'
