SET NETLIST NAME headed
ADD PORT A in
WRITE VERILOG empty-fields.v
Set Application Demo dropped
Set Command run  it "a  b"
Set Device "K7 484"
Set Purpose aaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaa eightchr next bbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbb end
Set Reference ccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccc see   "a   b"
WRITE VHDL ./all-fields.vhd
WRITE VERILOG all-fields.v
