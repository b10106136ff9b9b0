--------------------------------------------------------------------------------
-- Copyright (c) Orvane. All rights reserved.
--------------------------------------------------------------------------------
--##          ##
--###        ###
-- ###      ###   Vendor: Orvane 
--  ###    ###    Version : 0.1.0
--   ###  ###     Application : Demo
--    ######      Filename : all-fields.vhd
--     ####       Timestamp : MM/DD/YYYY hh:mm:ss
--  ===========
-- =============
--
--Command: run it a  b
--Design Name: headed
--Device: K7 484
--Purpose:
--    aaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaaa eightchr 
--    next 
--    bbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbbb 
--    end 
--Reference
--    
--    ccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccccc 
--    see a b 
--

library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity headed is
   port ( A : in    std_logic);
end headed;

architecture BEHAVIORAL of headed is
begin
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_headed of  headed is
   for BEHAVIORAL
   end for;
end CFG_headed;
-- synopsys translate_on

