
entity lean is
   port ( A : in    std_logic; 
          Y : out   std_logic);
end lean;

architecture BEHAVIORAL of lean is
   signal N : std_logic;
   component AND2
      port ( I0 : in    std_logic; 
             I1 : in    std_logic; 
             O  : out   std_logic);
   end component;
   
begin
   U1 : AND2
      port map (I0=>A,
                I1=>N,
                O=>Y);
   
end BEHAVIORAL;

-- synopsys translate_off
configuration CFG_lean of  lean is
   for BEHAVIORAL
      for U1 : AND2
         use configuration WORK.CFG_AND2;
      end for;
   end for;
end CFG_lean;
-- synopsys translate_on

