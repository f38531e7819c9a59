autocmd BufNewFile,BufRead *.szn setfiletype zornet
