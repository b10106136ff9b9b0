
library ieee;
use ieee.std_logic_1164.ALL;
use ieee.numeric_std.ALL;
library KORBAL;
use KORBAL.Kelements.ALL;

entity MORVANE_m is
   -- synopsys translate_off
   generic( INIT : integer :=  7);
   -- synopsys translate_on
   port ( A : in    std_logic; 
          Y : out   std_logic_vector (3 downto 0));
end MORVANE_m;

architecture BEHAVIORAL of MORVANE_m is
   component LUT
      generic( INIT : integer :=  1);
      port ( A : in    std_logic; 
             O : out   std_logic);
   end component;
   
   component RAW
      port ( A : in    std_logic; 
             O : out   std_logic);
   end component;
   
begin
   U1 : LUT
   generic map( INIT => INIT)
      port map (A=>A,
                O=>Y(0));
   
   U2 : RAW
   generic map( INIT => 5,
            X => 1)
      port map (A=>A,
                O=>Y(1));
   
   U3 : LUT
   generic map( INIT => INIT
   -- synopsys translate_off
   ,
            WIDTH => 2
   -- synopsys translate_on
   )
      port map (A=>A,
                O=>Y(2));
   
   U4 : LUT
   generic map( INIT => INIT)
      port map (A=>A,
                O=>Y(3));
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_MORVANE_m of  MORVANE_m is
   for BEHAVIORAL
      for U1, U3, U4 : LUT
         use configuration WORK.CFG_LUT;
      end for;
      for U2 : RAW
         use configuration WORK.CFG_RAW;
      end for;
   end for;
end CFG_MORVANE_m;
-- synopsys translate_on

